// Stand-in only: the application's side of the plug-in registry, for tests
// and for the host's own graph and command engine. It makes instances of
// registered classes through the callbacks their plug-ins registered.
#pragma once

#include <openvorla/VPxCommand.h>
#include <openvorla/VPxData.h>
#include <openvorla/VPxFileTranslator.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VTypeId.h>
#include <openvorla/VTypes.h>

#include <string>
#include <vector>

namespace standin {

// One callback as a registration recorded it.
struct RegisteredCallback {
  std::string role;  // "creator", "initializer", "syntax creator", ...
  bool script;       // a script object rather than a C++ function
  PyObject *object;  // the script object, held by the registry; null for a function
  std::string makes;  // the plug-in class of the instances it makes ("VPxNode"), or empty
};

// One registration, as tests read it.
struct RegistrationInfo {
  std::string kind;            // the registering member without "register": "Node", "Command", ...
  std::string name;            // for string resources, the procedure's
  std::string secondName;      // tool command, URI scheme or data location
  std::string classification;  // node classification, when one was given
  std::string plugin;          // the registering plug-in's name
  unsigned int typeId;         // type id or unique id; 0 for kinds without one
  unsigned int secondTypeId;   // a transform's matrix type id
  int flags;                   // node or data type, priority, interpolator flags, ...
  std::vector<RegisteredCallback> callbacks;  // in argument order, absent ones left out

  int scriptCallables() const {
    int n = 0;
    for (const RegisteredCallback &c : callbacks) n += c.script;
    return n;
  }
};

// The VPxNode::Type of the nodes of a registered node type (registerShape:
// kSurfaceShape, registerTransform: kTransformNode); kDependNode when none is
// registered under the name.
OPENVORLA_EXPORT int nodeKind(const std::string &typeName);

// Every registration of the loaded plug-ins, in the order they were made.
OPENVORLA_EXPORT std::vector<RegistrationInfo> registrations();

// A new node of a registered node, shape or transform type, made by its
// creator and owned by the caller, with its identity set; null if the type is
// unknown or the creator failed (a script's failure is in the log).
OPENVORLA_EXPORT OPENVORLA_NAMESPACE::VPxNode *createNode(
    const OPENVORLA_NAMESPACE::VString &typeName);
// A number that names the registration of the node type: it changes when
// the type is registered anew (by a reloaded plug-in, say); 0 when no type
// of that name is registered.
OPENVORLA_EXPORT unsigned long nodeTypeSerial(const OPENVORLA_NAMESPACE::VString &typeName);
// Starts the declarations of the type, runs its initializer and ends them.
OPENVORLA_EXPORT OPENVORLA_NAMESPACE::VStatus initializeNode(
    const OPENVORLA_NAMESPACE::VString &typeName);
// A new command of a registered command, constraint command or tool command.
OPENVORLA_EXPORT OPENVORLA_NAMESPACE::VPxCommand *createCommand(
    const OPENVORLA_NAMESPACE::VString &commandName);
// The syntax the command's syntax creator makes: `given` false when it was
// registered without one (or with None). A failing syntax creator is
// kFailure, its failure in the log.
OPENVORLA_EXPORT OPENVORLA_NAMESPACE::VStatus commandSyntax(
    const OPENVORLA_NAMESPACE::VString &commandName, OPENVORLA_NAMESPACE::VSyntax *syntax,
    bool *given);
OPENVORLA_EXPORT OPENVORLA_NAMESPACE::VPxData *createData(
    const OPENVORLA_NAMESPACE::VTypeId &typeId);
OPENVORLA_EXPORT OPENVORLA_NAMESPACE::VPxData *createData(
    const OPENVORLA_NAMESPACE::VString &typeName);
OPENVORLA_EXPORT OPENVORLA_NAMESPACE::VPxFileTranslator *createTranslator(
    const OPENVORLA_NAMESPACE::VString &translatorName);
// The options a file translator was registered with; "" for none.
OPENVORLA_EXPORT std::string translatorDefaultOptions(
    const OPENVORLA_NAMESPACE::VString &translatorName);

// Deletion as the host does it: through the virtual destructor, without the
// interpreter lock.
OPENVORLA_EXPORT void deleteNode(OPENVORLA_NAMESPACE::VPxNode *node);
OPENVORLA_EXPORT void deleteCommand(OPENVORLA_NAMESPACE::VPxCommand *command);
OPENVORLA_EXPORT void deleteData(OPENVORLA_NAMESPACE::VPxData *data);
OPENVORLA_EXPORT void deleteTranslator(OPENVORLA_NAMESPACE::VPxFileTranslator *translator);

// How many times VFnPlugin::setRegisteringCallableScript() was called since
// the last reset.
OPENVORLA_EXPORT long announcements();
OPENVORLA_EXPORT void resetAnnouncements();

}  // namespace standin
