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
  // Without a leading '.'; "" by default.
  virtual VString defaultExtension() const;
  // The file browser's pattern: "*." and the default extension, or "*.*".
  virtual VString filter() const;
  // The file and its first size bytes.
  virtual VFileKind identifyFile(const VFileObject &file, const char *buffer, short size) const;

  // The access mode of the file operation that runs; kUnknownAccessMode
  // outside one.
  static FileAccessMode fileAccessMode();

protected:
  // What the host may do with the translator beyond reading and writing,
  // which it asks when it lists translators for its file dialogs. Whether
  // it can load references, keeps the namespaces of what it reads, and may
  // be handed several files at once: false by default. Whether a file it
  // wrote can be opened as a scene: true.
  virtual bool haveReferenceMethod() const;
  virtual bool haveNamespaceSupport() const;
  virtual bool allowMultipleFileOptimization() const;
  virtual bool canBeOpened() const;
};

OPENVORLA_NAMESPACE_CLOSE
