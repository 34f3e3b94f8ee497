// Base class of plug-in translators that filter the ASCII scene format.
//
// The host reads the format itself, without the filter. While writing it asks
// the filter, through the writes* members, whether each statement goes to the
// file, and lets it add text of its own at fixed places through the write*
// members; by default everything is written and nothing is added.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VDagPath.h>
#include <openvorla/VFileObject.h>
#include <openvorla/VObject.h>
#include <openvorla/VPlug.h>
#include <openvorla/VPxFileTranslator.h>
#include <openvorla/VPxVorlaAsciiFilterOutput.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxVorlaAsciiFilter : public VPxFileTranslator {
public:
  VPxVorlaAsciiFilter();
  ~VPxVorlaAsciiFilter() override;

  // The writer writes the header, the requirements, the node and connection
  // blocks and the trailer, calling the hooks in that order, and stops at
  // the first hook that fails.
  VStatus writer(const VFileObject &file, const VString &optionsString,
                 FileAccessMode mode) override;
  bool haveWriteMethod() const override;      // true
  VString defaultExtension() const override;  // "va"

  // Whether the file's metadata block is written.
  virtual bool writesMetadata() const;

protected:
  virtual bool writesRequirements() const;
  virtual bool writesCreateNode(const VObject &node) const;
  virtual bool writesAddAttr(const VPlug &plug) const;
  virtual bool writesSetAttr(const VPlug &srcPlug) const;
  virtual bool writesConnectAttr(const VPlug &srcPlug, const VPlug &destPlug) const;
  virtual bool writesDisconnectAttr(const VPlug &srcPlug, const VPlug &destPlug) const;
  virtual bool writesParentNode(const VDagPath &parent, const VDagPath &child) const;
  virtual bool writesSelectNode(const VObject &node) const;
  virtual bool writesFileReference(const VFileObject &referenceFile) const;

  virtual VStatus writePostHeader(VPxVorlaAsciiFilterOutput &fileIO);
  virtual VStatus writePreRequirements(VPxVorlaAsciiFilterOutput &fileIO);
  virtual VStatus writePostRequirements(VPxVorlaAsciiFilterOutput &fileIO);
  virtual VStatus writePreCreateNodesBlock(VPxVorlaAsciiFilterOutput &fileIO);
  virtual VStatus writePostCreateNodesBlock(VPxVorlaAsciiFilterOutput &fileIO);
  virtual VStatus writePreConnectAttrsBlock(VPxVorlaAsciiFilterOutput &fileIO);
  virtual VStatus writePostConnectAttrsBlock(VPxVorlaAsciiFilterOutput &fileIO);
  virtual VStatus writePreTrailer(VPxVorlaAsciiFilterOutput &fileIO);

  // The file being written; unset outside the writer.
  VFileObject file() const;

private:
  VFileObject fFile;
};

OPENVORLA_NAMESPACE_CLOSE
