// VPxFileResolver: the host's default resolver, the registered resolvers and
// the path helpers.
#include <openvorla/VPxFileResolver.h>

#include <standin/Lifetime.h>
#include <standin/Registry.h>

#include <fstream>
#include <string>

OPENVORLA_NAMESPACE_OPEN

namespace {

// The name or the scheme of every registered resolver.
VStringArray listResolvers(bool schemes) {
  VStringArray found;
  for (const standin::RegistrationInfo &r : standin::registrations())
    if (r.kind == "URIFileResolver")
      found.append(VString((schemes ? r.secondName : r.name).c_str()));
  return found;
}

}  // namespace

VPxFileResolver::VPxFileResolver() { standin::noteConstructed("VPxFileResolver"); }
VPxFileResolver::~VPxFileResolver() { standin::noteDestroyed("VPxFileResolver"); }

VString VPxFileResolver::resolveURI(const VURI &, VFileResolverMode) { return VString(); }

VString VPxFileResolver::resolveURIWithContext(const VURI &, VFileResolverMode, const VString &) {
  return VString();
}

VString VPxFileResolver::uriScheme() const { return VString(); }

VStatus VPxFileResolver::performAfterSaveURI(const VURI &, const VString &) {
  return VStatus::kSuccess;
}

VStringArray VPxFileResolver::getURIResolversByName() { return listResolvers(false); }
VStringArray VPxFileResolver::getURIResolversBySchemes() { return listResolvers(true); }

const char *VPxFileResolver::className() { return "VPxFileResolver"; }

bool VPxFileResolver::fileExists(const VString &path) const {
  return path.numChars() && std::ifstream(path.asUTF8()).good();
}

VString VPxFileResolver::joinPath(const VString &directory, const VString &fileName) const {
  std::string dir = directory.asUTF8();
  if (dir.empty()) return fileName;
  if (dir.back() != '/') dir += '/';
  return VString((dir + fileName.asUTF8()).c_str());
}

VString VPxFileResolver::fileName(const VString &path) const {
  std::string text = path.asUTF8();
  return VString(text.substr(text.rfind('/') + 1).c_str());
}

VString VPxFileResolver::directory(const VString &path) const {
  std::string text = path.asUTF8();
  std::string::size_type slash = text.rfind('/');
  return slash == std::string::npos ? VString() : VString(text.substr(0, slash).c_str());
}

OPENVORLA_NAMESPACE_CLOSE
