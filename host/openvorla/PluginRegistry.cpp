// The plug-in registry and the application's side of it: making instances of
// registered classes through their callbacks.
#include "PluginRegistry.h"

#include <openvorla/VFnPlugin.h>
#include <openvorla/VPxCommand.h>
#include <openvorla/VPxData.h>
#include <openvorla/VPxFileTranslator.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VTypeId.h>

#include <standin/Nodes.h>
#include <standin/Objects.h>
#include <standin/Operation.h>
#include <standin/Registry.h>
#include <standin/ScriptCallables.h>

#include <basekit/Tlog.h>

#include <algorithm>
#include <atomic>
#include <cstdio>
#include <cstring>
#include <mutex>
#include <string>

#include "BaseAttributes.h"

OPENVORLA_NAMESPACE_OPEN

namespace {

std::atomic<const standin::ScriptCallableHooks *> gHooks{nullptr};

// Registrations whose names must differ share a namespace: all commands; all
// node and data types, which also share type ids; otherwise each kind alone.
enum class Namespace { kCommands, kTypes, kOwn };

struct KindTraits {
  const char *key;   // the registering member without "register"
  const char *noun;  // in messages
  Namespace space;
  std::vector<CallbackRole> required;
  bool uniqueId;  // its id must differ from the others of its kind or namespace
  // The plug-in class the creator's instances are made as; null when the
  // kind's creator makes no instance of a plug-in class.
  const char *makes;
};

const KindTraits &traits(RegistrationKind kind) {
  using R = CallbackRole;
  static const KindTraits table[] = {
      {"Command", "command", Namespace::kCommands, {R::kCreator}, false, "VPxCommand"},
      {"ControlCommand",
       "control command",
       Namespace::kCommands,
       {R::kCreator},
       false,
       "VPxControlCommand"},
      {"ModelEditorCommand",
       "model editor command",
       Namespace::kCommands,
       {R::kCreator, R::kPaneCreator},
       false,
       "VPxModelEditorCommand"},
      {"ConstraintCommand",
       "constraint command",
       Namespace::kCommands,
       {R::kCreator},
       false,
       "VPxConstraintCommand"},
      {"ContextCommand",
       "context command",
       Namespace::kCommands,
       {R::kCreator},
       false,
       "VPxContextCommand"},
      {"Node", "node type", Namespace::kTypes, {R::kCreator, R::kInitializer}, true, "VPxNode"},
      {"Shape",
       "shape type",
       Namespace::kTypes,
       {R::kCreator, R::kInitializer},
       true,
       "VPxSurfaceShape"},
      {"Transform",
       "transform type",
       Namespace::kTypes,
       {R::kCreator, R::kInitializer, R::kMatrixCreator},
       true,
       "VPxTransform"},
      {"Data", "data type", Namespace::kTypes, {R::kCreator}, true, "VPxData"},
      {"Device", "device", Namespace::kOwn, {R::kCreator}, false, "VPxMidiInputDevice"},
      {"IkSolver", "IK solver", Namespace::kOwn, {R::kCreator}, false, "VPxIkSolverNode"},
      {"CacheFormat", "cache format", Namespace::kOwn, {R::kCreator}, false, "VPxCacheFormat"},
      {"DragAndDropBehavior",
       "drag and drop behavior",
       Namespace::kOwn,
       {R::kCreator},
       false,
       "VPxDragAndDropBehavior"},
      {"AttributePatternFactory",
       "attribute pattern factory",
       Namespace::kOwn,
       {R::kCreator},
       false,
       "VPxAttributePatternFactory"},
      {"Renderer", "renderer", Namespace::kOwn, {R::kCreator}, false, nullptr},
      {"MaterialInfo",
       "material information",
       Namespace::kOwn,
       {R::kCreator},
       false,
       "VPxMaterialInformation"},
      {"BakeEngine", "bake engine", Namespace::kOwn, {R::kCreator}, false, "VPxBakeEngine"},
      {"Evaluator", "evaluator", Namespace::kOwn, {R::kCreator}, true, nullptr},
      {"TopologyEvaluator", "topology evaluator", Namespace::kOwn, {R::kCreator}, true, nullptr},
      {"FileTranslator",
       "file translator",
       Namespace::kOwn,
       {R::kCreator},
       false,
       "VPxFileTranslator"},
      {"URIFileResolver",
       "URI file resolver",
       Namespace::kOwn,
       {R::kCreator},
       false,
       "VPxFileResolver"},
      {"UIStrings",
       "string resource set",
       Namespace::kOwn,
       {R::kStringRegistration},
       false,
       nullptr},
      {"ImageFile", "image file format", Namespace::kOwn, {R::kCreator}, false, "VPxImageFile"},
      {"RenderPassImpl",
       "render pass implementation",
       Namespace::kOwn,
       {R::kCreator},
       false,
       "VPxRenderPassImpl"},
      {"AnimCurveInterpolator",
       "anim curve interpolator",
       Namespace::kOwn,
       {R::kCreator},
       true,
       "VPxAnimCurveInterpolator"},
  };
  return table[static_cast<int>(kind)];
}

// The plug-in class a callback's instances are made as, or null: the host
// checks what a script's creator returns against it.
const char *makes(RegistrationKind kind, CallbackRole role) {
  switch (role) {
    case CallbackRole::kCreator:
      return traits(kind).makes;
    case CallbackRole::kToolCommandCreator:
      return "VPxToolCommand";
    case CallbackRole::kMatrixCreator:
      return "VPxTransformationMatrix";
    default:
      return nullptr;
  }
}

const char *roleName(CallbackRole role) {
  switch (role) {
    case CallbackRole::kCreator:
      return "creator";
    case CallbackRole::kInitializer:
      return "initializer";
    case CallbackRole::kSyntaxCreator:
      return "syntax creator";
    case CallbackRole::kPaneCreator:
      return "pane creator";
    case CallbackRole::kToolCommandCreator:
      return "tool command creator";
    case CallbackRole::kUICreator:
      return "UI creator";
    case CallbackRole::kMatrixCreator:
      return "matrix creator";
    case CallbackRole::kStringRegistration:
      return "string registration";
  }
  return "callback";
}

bool sameNamespace(RegistrationKind a, RegistrationKind b) {
  Namespace space = traits(a).space;
  return space == Namespace::kOwn ? a == b : space == traits(b).space;
}

VString quoted(const VString &name) { return VString("'") + name + "'"; }

// The noun with its indefinite article.
VString a(const char *noun) {
  return VString(std::strchr("aeioAEIO", noun[0]) ? "an " : "a ") + noun;
}

VString hex(unsigned int id) {
  char text[16];
  std::snprintf(text, sizeof text, "0x%x", id);
  return text;
}

VString describe(const Registration &r) {
  return VString("the ") + traits(r.kind).noun + " " + quoted(r.name);
}

VString capital(const VString &text) {
  std::string utf8 = text.asUTF8();
  if (!utf8.empty() && utf8[0] >= 'a' && utf8[0] <= 'z') utf8[0] = static_cast<char>(utf8[0] - 32);
  return utf8.c_str();
}

struct Registry {
  std::mutex mutex;
  std::vector<RegistrationPtr> entries;  // in the order they were made
  unsigned long made = 0;                // instances made, for their names
  unsigned long added = 0;               // registrations added, for their serial numbers

  // The registration that one of the new one's names clashes with, if any,
  // and that name.
  const Registration *nameClash(const Registration &r, VString &clashing) const {
    std::vector<VString> names{r.name};
    if (hasToolCommand(r)) names.push_back(r.secondName);
    for (const RegistrationPtr &e : entries) {
      if (!sameNamespace(e->kind, r.kind)) continue;
      for (const VString &name : names)
        if (e->name == name || (hasToolCommand(*e) && e->secondName == name)) {
          clashing = name;
          return e.get();
        }
    }
    return nullptr;
  }

  // A context command's tool command is a command of its own name.
  static bool hasToolCommand(const Registration &r) {
    return r.kind == RegistrationKind::kContextCommand && r.secondName.length();
  }

  const Registration *idClash(const Registration &r) const {
    if (!traits(r.kind).uniqueId) return nullptr;
    for (const RegistrationPtr &e : entries)
      if (sameNamespace(e->kind, r.kind) && traits(e->kind).uniqueId && e->typeId == r.typeId)
        return e.get();
    return nullptr;
  }

  template <typename Match>
  RegistrationPtr find(Match match) {
    std::lock_guard<std::mutex> guard(mutex);
    for (const RegistrationPtr &e : entries)
      if (match(*e)) return e;
    return nullptr;
  }
};

// Never destroyed: registrations still held at exit would release their
// script objects after the interpreter is gone.
Registry &theRegistry() {
  static Registry *registry = new Registry;
  return *registry;
}

VStatus refuse(const VString &message) { return VStatus(VStatus::kInvalidParameter, message); }
VStatus fail(const VString &message) { return VStatus(VStatus::kFailure, message); }

bool isNodeKind(RegistrationKind kind) {
  return kind == RegistrationKind::kNode || kind == RegistrationKind::kShape ||
         kind == RegistrationKind::kTransform;
}

}  // namespace

Registration::~Registration() {
  const standin::ScriptCallableHooks *hooks = gHooks.load();
  if (!hooks) return;
  for (const Callback &c : callbacks)
    if (c.script) hooks->release(c.script);
}

const Callback *Registration::find(CallbackRole role) const {
  for (const Callback &c : callbacks)
    if (c.role == role) return &c;
  return nullptr;
}

namespace registry {

VStatus add(const RegistrationPtr &r, Released &released) {
  const KindTraits &kind = traits(r->kind);
  if (r->name.length() == 0) return refuse(capital(a(kind.noun)) + " needs a name");
  std::vector<CallbackRole> required = kind.required;
  if (Registry::hasToolCommand(*r)) required.push_back(CallbackRole::kToolCommandCreator);
  for (CallbackRole role : required)
    if (!r->find(role)) return refuse(capital(describe(*r)) + " needs " + a(roleName(role)));
  if (r->find(CallbackRole::kToolCommandCreator) && !Registry::hasToolCommand(*r))
    return refuse(capital(describe(*r)) + " has a tool command creator but no tool command name");
  if (kind.space == Namespace::kTypes && r->typeId == 0)
    return refuse(capital(describe(*r)) + " needs a type id other than 0");

  Registry &registry = theRegistry();
  std::lock_guard<std::mutex> guard(registry.mutex);
  VString clashing;
  const Registration *clash = nullptr;
  if (r->kind == RegistrationKind::kUIStrings) {
    for (const RegistrationPtr &e : registry.entries)
      if (e->kind == r->kind && e->plugin == r->plugin)
        return fail("The plug-in has registered its string resources already");
  } else {
    clash = registry.nameClash(*r, clashing);
  }
  bool replace = clash && r->kind == RegistrationKind::kRenderPassImpl && r->overrideExisting;
  if (clash && !replace)
    return fail(VString("The name ") + quoted(clashing) + " is in use by " + describe(*clash));
  if (const Registration *taken = registry.idClash(*r))
    return fail(VString("The ") + (kind.space == Namespace::kTypes ? "type id " : "id ") +
                hex(r->typeId) + " is in use by " + describe(*taken));
  if (replace) {
    auto &entries = registry.entries;
    auto it = std::find_if(entries.begin(), entries.end(),
                           [clash](const RegistrationPtr &e) { return e.get() == clash; });
    released.push_back(std::move(*it));
    entries.erase(it);
  }
  r->serial = ++registry.added;
  registry.entries.push_back(r);
  return VStatus::kSuccess;
}

namespace {

template <typename Match>
VStatus removeMatching(const VObject &plugin, const Removal &removal, const VString &what,
                       Match match, Released &released) {
  Registry &registry = theRegistry();
  std::lock_guard<std::mutex> guard(registry.mutex);
  auto &entries = registry.entries;
  for (auto it = entries.begin(); it != entries.end(); ++it) {
    Registration &e = **it;
    if (!match(e)) continue;
    if (std::find(removal.begin(), removal.end(), e.kind) == removal.end())
      return refuse(capital(describe(e)) + " is not " + a(traits(removal.front()).noun));
    if (e.plugin != plugin)
      return fail(capital(describe(e)) + " was registered by another plug-in");
    released.push_back(std::move(*it));
    entries.erase(it);
    return VStatus::kSuccess;
  }
  return fail(VString("No ") + traits(removal.front()).noun + " " + what + " is registered");
}

}  // namespace

VStatus remove(const VObject &plugin, const Removal &removal, const VString &name,
               Released &released) {
  RegistrationKind kind = removal.front();
  return removeMatching(
      plugin, removal, VString("named ") + quoted(name),
      [&](const Registration &e) { return sameNamespace(e.kind, kind) && e.name == name; },
      released);
}

VStatus remove(const VObject &plugin, const Removal &removal, unsigned int typeId,
               Released &released) {
  RegistrationKind kind = removal.front();
  return removeMatching(
      plugin, removal, VString("with type id ") + hex(typeId),
      [&](const Registration &e) {
        return sameNamespace(e.kind, kind) && traits(e.kind).uniqueId && e.typeId == typeId;
      },
      released);
}

VStatus removeContextCommand(const VObject &plugin, const VString &name, const VString *toolCmdName,
                             Released &released) {
  if (toolCmdName) {
    RegistrationPtr context = theRegistry().find([&](const Registration &e) {
      return e.kind == RegistrationKind::kContextCommand && e.name == name && e.plugin == plugin;
    });
    if (context && context->secondName != *toolCmdName)
      return refuse(capital(describe(*context)) +
                    (context->secondName.length()
                         ? VString(" runs the tool command ") + quoted(context->secondName)
                         : VString(" has no tool command")));
  }
  return remove(plugin, {RegistrationKind::kContextCommand}, name, released);
}

void removeAll(const VObject &plugin, Released &released) {
  Registry &registry = theRegistry();
  std::lock_guard<std::mutex> guard(registry.mutex);
  auto &entries = registry.entries;
  auto kept = std::stable_partition(entries.begin(), entries.end(),
                                    [&](const RegistrationPtr &e) { return e->plugin != plugin; });
  std::move(kept, entries.end(), std::back_inserter(released));
  entries.erase(kept, entries.end());
}

void clear(Released &released) {
  Registry &registry = theRegistry();
  std::lock_guard<std::mutex> guard(registry.mutex);
  std::move(registry.entries.begin(), registry.entries.end(), std::back_inserter(released));
  registry.entries.clear();
}

bool isNodeRegistered(const VString &typeName) {
  return theRegistry().find([&](const Registration &e) {
    return isNodeKind(e.kind) && e.name == typeName;
  }) != nullptr;
}

unsigned int matrixTypeId(const VObject &plugin, unsigned int transformTypeId) {
  RegistrationPtr transform = theRegistry().find([&](const Registration &e) {
    return e.kind == RegistrationKind::kTransform && e.typeId == transformTypeId &&
           e.plugin == plugin;
  });
  return transform ? transform->secondTypeId : 0;
}

}  // namespace registry

namespace {

// An instance made by the callback, as the class its role makes; null if it
// made none.
void *make(const Registration &r, const Callback &creator) {
  if (!creator.script) return reinterpret_cast<VCreatorFunction>(creator.function)();
  if (const standin::ScriptCallableHooks *hooks = gHooks.load())
    return hooks->create(creator.script, makes(r.kind, creator.role));
  Tlog::write(std::string("No scripting engine to run the creator of ") + describe(r).asUTF8());
  return nullptr;
}

RegistrationPtr findNamed(const VString &name, bool (*kindOk)(RegistrationKind)) {
  return theRegistry().find(
      [&](const Registration &e) { return kindOk(e.kind) && e.name == name; });
}

bool isCommandKind(RegistrationKind kind) {
  return kind == RegistrationKind::kCommand || kind == RegistrationKind::kConstraintCommand;
}

}  // namespace

OPENVORLA_NAMESPACE_CLOSE

namespace standin {

using namespace OPENVORLA_NAMESPACE;

void setScriptCallableHooks(const ScriptCallableHooks *hooks) { gHooks.store(hooks); }

ScriptsHeld::ScriptsHeld() : fHooks(gHooks.load()), fHeld(fHooks ? fHooks->hold() : nullptr) {}
ScriptsHeld::~ScriptsHeld() {
  if (fHooks) fHooks->unhold(fHeld);
}

int nodeKind(const std::string &typeName) {
  RegistrationPtr r = findNamed(VString(typeName.c_str()), isNodeKind);
  if (!r) return VPxNode::kDependNode;
  if (r->kind == RegistrationKind::kTransform) return VPxNode::kTransformNode;
  if (r->kind == RegistrationKind::kShape) return VPxNode::kSurfaceShape;
  return r->flags;
}

std::vector<RegistrationInfo> registrations() {
  std::vector<RegistrationPtr> entries;
  {
    Registry &registry = theRegistry();
    std::lock_guard<std::mutex> guard(registry.mutex);
    entries = registry.entries;
  }
  std::vector<RegistrationInfo> out;
  for (const RegistrationPtr &e : entries) {
    RegistrationInfo info{traits(e->kind).key,
                          e->name.asUTF8(),
                          e->secondName.asUTF8(),
                          e->classification.asUTF8(),
                          pluginName(e->plugin).asUTF8(),
                          e->typeId,
                          e->secondTypeId,
                          e->flags,
                          {}};
    for (const Callback &c : e->callbacks)
      info.callbacks.push_back({roleName(c.role), c.script != nullptr, c.script,
                                makes(e->kind, c.role) ? makes(e->kind, c.role) : ""});
    out.push_back(std::move(info));
  }
  return out;
}

VPxNode *createNode(const VString &typeName) {
  RegistrationPtr r = findNamed(typeName, isNodeKind);
  if (!r) return nullptr;
  auto *node = static_cast<VPxNode *>(make(*r, *r->find(CallbackRole::kCreator)));
  if (!node) return nullptr;
  VFn::Type type = r->kind == RegistrationKind::kTransform ? VFn::kTransform
                   : r->kind == RegistrationKind::kShape   ? VFn::kDagNode
                                                           : VFn::kDependencyNode;
  unsigned long n;
  {
    Registry &registry = theRegistry();
    std::lock_guard<std::mutex> guard(registry.mutex);
    n = ++registry.made;
  }
  std::string name = std::string(typeName.asUTF8()) + std::to_string(n);
  setNodeIdentity(*node, makeObject(type, name.c_str()), typeName.asUTF8(), VTypeId(r->typeId));
  return node;
}

unsigned long nodeTypeSerial(const VString &typeName) {
  RegistrationPtr r = findNamed(typeName, isNodeKind);
  return r ? r->serial : 0;
}

VStatus initializeNode(const VString &typeName) {
  RegistrationPtr r = findNamed(typeName, isNodeKind);
  if (!r)
    return VStatus(VStatus::kInvalidParameter,
                   VString("No node type named ") + quoted(typeName) + " is registered");
  const Callback &init = *r->find(CallbackRole::kInitializer);
  // The declarations end however the initializer does, a C++ exception included.
  struct Declaring {
    explicit Declaring(int kind) { beginNodeType(bases::ofKind(kind).attributes); }
    ~Declaring() { endNodeType(); }
  };
  VStatus status = VStatus::kSuccess;
  std::string why;
  {
    Declaring declaring(nodeKind(typeName.asUTF8()));
    if (!init.script) {
      status = reinterpret_cast<VInitializeFunction>(init.function)();
    } else {
      Doing initializing(nullptr, nullptr, [&] {
        return Operation::Description{pluginName(r->plugin).asUTF8(),
                                      "initializing " + std::string(describe(*r).asUTF8())};
      });
      const ScriptCallableHooks *hooks = gHooks.load();
      if (!hooks || !hooks->run(init.script)) status = VStatus::kFailure;
      why = initializing.failure();
    }
  }
  if (status) return status;
  // A script's failure is in the log; its status says no more than the
  // exception it raised.
  VString message = VString("The initializer of ") + describe(*r) + " failed";
  if (!init.script) message += VString(": ") + status.errorString();
  if (!why.empty()) message += VString(": ") + why.c_str();
  return VStatus(status.statusCode(), message);
}

VPxCommand *createCommand(const VString &commandName) {
  RegistrationPtr r = findNamed(commandName, isCommandKind);
  CallbackRole role = CallbackRole::kCreator;
  if (!r) {
    r = theRegistry().find([&](const Registration &e) {
      return e.kind == RegistrationKind::kContextCommand && e.secondName.length() &&
             e.secondName == commandName;
    });
    role = CallbackRole::kToolCommandCreator;
  }
  return r ? static_cast<VPxCommand *>(make(*r, *r->find(role))) : nullptr;
}

VStatus commandSyntax(const VString &commandName, VSyntax *syntax, bool *given) {
  *given = false;
  RegistrationPtr r = findNamed(commandName, isCommandKind);
  if (!r)
    r = theRegistry().find([&](const Registration &e) {
      return e.kind == RegistrationKind::kContextCommand && e.secondName.length() &&
             e.secondName == commandName;
    });
  const Callback *creator = r ? r->find(CallbackRole::kSyntaxCreator) : nullptr;
  if (!creator) return VStatus::kSuccess;
  if (!creator->script) {
    *syntax = reinterpret_cast<VCreateSyntaxFunction>(creator->function)();
    *given = true;
    return VStatus::kSuccess;
  }
  const standin::ScriptCallableHooks *hooks = gHooks.load();
  int read = hooks ? hooks->value(creator->script, "VSyntax",
                                  [](const void *made, void *out) {
                                    *static_cast<VSyntax *>(out) =
                                        *static_cast<const VSyntax *>(made);
                                  },
                                  syntax)
                   : 0;
  *given = read == 1;
  if (read < 0)
    return VStatus(VStatus::kFailure, ("The syntax creator of the command '" +
                                       std::string(commandName.asUTF8()) + "' failed")
                                          .c_str());
  return VStatus::kSuccess;
}

VPxData *createData(const VTypeId &typeId) {
  RegistrationPtr r = theRegistry().find([&](const Registration &e) {
    return e.kind == RegistrationKind::kData && e.typeId == typeId.id();
  });
  return r ? static_cast<VPxData *>(make(*r, *r->find(CallbackRole::kCreator))) : nullptr;
}

VPxData *createData(const VString &typeName) {
  RegistrationPtr r = findNamed(typeName, [](RegistrationKind k) {
    return k == RegistrationKind::kData;
  });
  return r ? static_cast<VPxData *>(make(*r, *r->find(CallbackRole::kCreator))) : nullptr;
}

std::string translatorDefaultOptions(const VString &translatorName) {
  RegistrationPtr r = findNamed(translatorName, [](RegistrationKind k) {
    return k == RegistrationKind::kFileTranslator;
  });
  return r ? r->defaultOptions.asUTF8() : "";
}

VPxFileTranslator *createTranslator(const VString &translatorName) {
  RegistrationPtr r = findNamed(translatorName, [](RegistrationKind k) {
    return k == RegistrationKind::kFileTranslator;
  });
  return r ? static_cast<VPxFileTranslator *>(make(*r, *r->find(CallbackRole::kCreator))) : nullptr;
}

void deleteNode(VPxNode *node) { delete node; }
void deleteCommand(VPxCommand *command) { delete command; }
void deleteData(VPxData *data) { delete data; }
void deleteTranslator(VPxFileTranslator *translator) { delete translator; }

}  // namespace standin
