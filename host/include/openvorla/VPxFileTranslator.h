// Base class of plug-in file importers and exporters.
//
// The host's defaults describe a translator that can do nothing: it reads
// and writes no files and recognises none.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VFileObject.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

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

  // kNotImplemented by default.
  virtual VStatus reader(const VFileObject &file, const VString &optionsString,
                         FileAccessMode mode);
  virtual VStatus writer(const VFileObject &file, const VString &optionsString,
                         FileAccessMode mode);
  virtual bool haveReadMethod() const;
  virtual bool haveWriteMethod() const;
  virtual bool haveReferenceMethod() const;
  virtual bool haveNamespaceSupport() const;
  // Whether the host may hand several files to one reader call; false by default.
  virtual bool allowMultipleFileOptimization() const;
  // Without a leading '.'; "" by default.
  virtual VString defaultExtension() const;
  // The file browser's pattern: "*." and the default extension, or "*.*".
  virtual VString filter() const;
  // Whether a file written by the translator can be opened as a scene; true.
  virtual bool canBeOpened() const;
  // The file and its first size bytes.
  virtual VFileKind identifyFile(const VFileObject &file, const char *buffer, short size) const;

  // The access mode of the file operation that runs; kUnknownAccessMode
  // outside one.
  static FileAccessMode fileAccessMode();
};

OPENVORLA_NAMESPACE_CLOSE
