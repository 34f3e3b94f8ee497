// The engines' shared helpers that need the registry.
#include <standin/Registry.h>

#include "HostCalls.h"

namespace standin {
namespace host {

// A context command's tool command goes by its own name.
std::string pluginOf(std::initializer_list<const char *> kinds, const std::string &name) {
  for (const RegistrationInfo &r : standin::registrations())
    for (const char *kind : kinds)
      if (r.kind == kind &&
          (r.name == name || (r.kind == "ContextCommand" && r.secondName == name)))
        return r.plugin;
  return {};
}

}  // namespace host
}  // namespace standin
