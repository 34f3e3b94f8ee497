// Base class of plug-in file importers and exporters.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxFileTranslator {
public:
  enum VFileKind {
    kIsMyFileType,
    kCouldBeMyFileType,
    kNotMyFileType
  };

  enum FileAccessMode {
    kUnknownAccessMode,
    kOpenAccessMode,
    kReferenceAccessMode,
    kImportAccessMode,
    kSaveAccessMode,
    kExportAccessMode,
    kExportActiveAccessMode
  };

  VPxFileTranslator();
  virtual ~VPxFileTranslator();
};

OPENVORLA_NAMESPACE_CLOSE
