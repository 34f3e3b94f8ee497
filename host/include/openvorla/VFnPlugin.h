// Function set through which a plug-in registers what it provides.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VFnBase.h>
#include <openvorla/VObject.h>
#include <openvorla/VPluginCallableInfo.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VStringArray.h>
#include <openvorla/VTypeId.h>
#include <openvorla/VTypes.h>

#include <cstddef>

#define PLUGIN_COMPANY "Halvern"

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VFnPlugin : public VFnBase {
public:
  enum ImageFilePriority {
    kImageFilePriorityHighest = 0,
    kImageFilePriorityHigh = 10,
    kImageFilePriorityLow = 20,
    kImageFilePriorityLowest = 30,
    kImageFilePriorityDefault = kImageFilePriorityHigh
  };

  VFnPlugin();  // attached to no plug-in: every member fails or reads empty
  // Attaches to the plug-in object the host passes to the plug-in's
  // initialization and records the vendor, version and required interface
  // version given; values left at their defaults do not replace recorded ones.
  // kInvalidParameter, and no plug-in attached, for an object that is not a
  // plug-in.
  VFnPlugin(VObject &object, const char *vendor = "Unknown", const char *version = "Unknown",
            const char *requiredApiVersion = "Any", VStatus *ReturnStatus = NULL);
  ~VFnPlugin() override;

  VString vendor() const;
  VString version() const;
  VString apiVersion() const;  // the interface version the plug-in requires
  VString name() const;
  VString loadPath() const;  // the folder the plug-in was loaded from
  // A name in use by another plug-in is refused with kFailure, or with
  // allowRename made unique by a number appended.
  VStatus setName(const VString &name, bool allowRename = true);
  VStatus setVersion(const VString &version);

  // The plug-in object of a loaded plug-in, or the null object.
  static VObject findPlugin(const VString &pluginName);
  // Whether a loaded plug-in has registered a node type of that name.
  static bool isNodeRegistered(const VString &typeName);
  // The matrix type registered with a transform type of this plug-in; 0 when
  // there is none.
  VTypeId matrixTypeIdFromXformId(const VTypeId &xformTypeId);

  // Adds an item to a menu, running the command with its parameters, and with
  // needOptionBox an option box running optBoxFunction. Item names are unique:
  // a number is appended to a name in use. Returns the names of the items made
  // (the item, then its option box). insertAfter names the item to follow.
  VStringArray addMenuItem(const VString &menuItemName, const VString &parentName,
                           const VString &commandName, const VString &commandParams,
                           bool needOptionBox, const VString *optBoxFunction = NULL,
                           VStatus *ReturnStatus = NULL, const VString *insertAfter = NULL);
  // The same with the label shown, which is otherwise the item name.
  VStringArray addMenuItem(const VString &menuItemName, const VString &menuItemLabel,
                           const VString &parentName, const VString &commandName,
                           const VString &commandParams, bool needOptionBox,
                           const VString *optBoxFunction = NULL, VStatus *ReturnStatus = NULL,
                           const VString *insertAfter = NULL);
  // Removes items of this plug-in; kInvalidParameter if a name is not one,
  // the others being removed all the same.
  VStatus removeMenuItem(VStringArray &menuItemNames);

  // The script procedures that build and tear down the plug-in's interface.
  // The host keeps them as given, without taking references.
  VStatus registerUI(PyObject *creationProc, PyObject *deletionProc,
                     PyObject *creationBatchProc = NULL, PyObject *deletionBatchProc = NULL);
  VStatus registerDisplayFilter(const VString &name, const VString &label,
                                const VString &classification);

  // Announces that the next callable given to a registration function is a
  // script object, not a function. registeringCallableScript() tells whether
  // one was announced, and takes the announcement back.
  static void setRegisteringCallableScript();
  static bool registeringCallableScript();
  // What the host knows of the callable being registered; not owned.
  void setCallableInfo(VPluginCallableInfo *info);
  VPluginCallableInfo *getCallableInfo();
  static const char *className();

  static const VString kDefaultDataLocation;
};

OPENVORLA_NAMESPACE_CLOSE
