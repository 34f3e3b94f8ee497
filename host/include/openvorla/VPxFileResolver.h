// Base class of plug-in resolvers of file URIs.
//
// A resolver registered for a URI scheme turns the URIs of that scheme that
// the scene refers to into paths the host can open. The host's defaults
// resolve nothing: every path is "".
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VStringArray.h>

OPENVORLA_NAMESPACE_OPEN

class VURI;

class OPENVORLA_EXPORT VPxFileResolver {
public:
  enum VFileResolverMode {
    kNone = 1,
    kInput
  };

  VPxFileResolver();
  virtual ~VPxFileResolver();

  virtual VString resolveURI(const VURI &uri, VFileResolverMode mode);
  // The same for a URI that a node holds, named by its full name.
  virtual VString resolveURIWithContext(const VURI &uri, VFileResolverMode mode,
                                        const VString &contextNodeFullName);
  // The scheme the resolver was written for; "" by default.
  virtual VString uriScheme() const;
  // The scene that refers to the URI was saved as newFileName; does nothing
  // by default.
  virtual VStatus performAfterSaveURI(const VURI &currentURI, const VString &newFileName);

  // The names and the schemes of the registered resolvers, in the order they
  // were registered.
  static VStringArray getURIResolversByName();
  static VStringArray getURIResolversBySchemes();
  static const char *className();

protected:
  // Path helpers for resolveURI(), on '/'-separated paths.
  bool fileExists(const VString &path) const;
  VString joinPath(const VString &directory, const VString &fileName) const;
  // The last component, and everything before it without the separator.
  VString fileName(const VString &path) const;
  VString directory(const VString &path) const;
};

OPENVORLA_NAMESPACE_CLOSE
