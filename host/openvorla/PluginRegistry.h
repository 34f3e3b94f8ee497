// The plug-in registry: what each loaded plug-in registered through
// VFnPlugin, with the callbacks the host makes instances through.
//
// A callback is either a C++ function or a script object that the plug-in's
// binding passed in the function's place, announcing it just before with
// VFnPlugin::setRegisteringCallableScript(). A registration reads that
// announcement once: all its callbacks are of the one form, since a binding
// passes only script objects and C++ code only functions. The registry owns
// one reference to each script object, handed to it by the binding; the
// Registration releases it when it dies. Registrations are shared, so that a
// caller making an instance keeps its callbacks alive even if the plug-in
// deregisters meanwhile, and they are only ever destroyed with no registry
// lock held: releasing a script object takes the interpreter lock.
#pragma once

#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VTypes.h>

#include <functional>
#include <memory>
#include <vector>

OPENVORLA_NAMESPACE_OPEN

enum class RegistrationKind {
  kCommand,
  kControlCommand,
  kModelEditorCommand,
  kConstraintCommand,
  kContextCommand,
  kNode,
  kShape,
  kTransform,
  kData,
  kDevice,
  kIkSolver,
  kCacheFormat,
  kDragAndDropBehavior,
  kAttributePatternFactory,
  kRenderer,
  kMaterialInfo,
  kBakeEngine,
  kEvaluator,
  kTopologyEvaluator,
  kFileTranslator,
  kURIFileResolver,
  kUIStrings,
  kImageFile,
  kRenderPassImpl,
  kAnimCurveInterpolator,
};

enum class CallbackRole {
  kCreator,
  kInitializer,
  kSyntaxCreator,
  kPaneCreator,
  kToolCommandCreator,
  kUICreator,
  kMatrixCreator,
  kStringRegistration,
};

struct Callback {
  CallbackRole role;
  void (*function)();  // the C++ function, cast back to its type where it is called
  PyObject *script;    // or the script object
};

class Registration {
 public:
  Registration(RegistrationKind kind, const VString &name, bool scriptCallables)
      : kind(kind), name(name), fScript(scriptCallables) {}
  ~Registration();
  Registration(const Registration &) = delete;
  Registration &operator=(const Registration &) = delete;

  // Records the callback in argument order; a null one is left out.
  template <typename Result, typename... Args>
  void add(CallbackRole role, Result (*callback)(Args...)) {
    if (!callback) return;
    if (fScript)
      callbacks.push_back({role, nullptr, reinterpret_cast<PyObject *>(callback)});
    else
      callbacks.push_back({role, reinterpret_cast<void (*)()>(callback), nullptr});
  }
  const Callback *find(CallbackRole role) const;

  const RegistrationKind kind;
  const VString name;
  VString secondName;
  VString classification;
  VString defaultOptions;  // a file translator's
  unsigned int typeId = 0;
  unsigned int secondTypeId = 0;
  int flags = 0;
  bool overrideExisting = false;
  unsigned long serial = 0;  // set when added: distinct for every registration ever added
  VObject plugin;
  std::vector<Callback> callbacks;

 private:
  const bool fScript;
};

using RegistrationPtr = std::shared_ptr<Registration>;
// Registrations taken out of the registry, to be destroyed once its lock and
// the plug-in table's are given up.
using Released = std::vector<RegistrationPtr>;

// The kinds a deregistering member removes, the first naming them in messages.
using Removal = std::vector<RegistrationKind>;

namespace registry {

// Adds the plug-in's registration, or refuses it. What it replaces goes to
// released.
VStatus add(const RegistrationPtr &registration, Released &released);
// Removes the plug-in's registration of one of the kinds, by name or type id.
VStatus remove(const VObject &plugin, const Removal &removal, const VString &name,
               Released &released);
VStatus remove(const VObject &plugin, const Removal &removal, unsigned int typeId,
               Released &released);
// The context command with its tool command, which must be toolCmdName if given.
VStatus removeContextCommand(const VObject &plugin, const VString &name, const VString *toolCmdName,
                             Released &released);
void removeAll(const VObject &plugin, Released &released);
void clear(Released &released);

bool isNodeRegistered(const VString &typeName);
// The matrix type id of the plug-in's transform type, or 0.
unsigned int matrixTypeId(const VObject &plugin, unsigned int transformTypeId);

}  // namespace registry

// The plug-in's current name, from the table of loaded plug-ins.
VString pluginName(const VObject &plugin);
// Adds the registration for the plug-in, which must be loaded.
VStatus submitRegistration(const VObject &plugin, RegistrationPtr registration);
// Runs remove if the plug-in is loaded, and releases what it removed.
VStatus withdrawRegistration(const VObject &plugin,
                             const std::function<VStatus(Released &)> &remove);

OPENVORLA_NAMESPACE_CLOSE
