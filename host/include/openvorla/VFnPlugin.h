// Function set through which a plug-in registers what it provides.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VFnBase.h>
#include <openvorla/VObject.h>
#include <openvorla/VPluginCallableInfo.h>
#include <openvorla/VPxData.h>
#include <openvorla/VPxNode.h>
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
  VStatus deregisterDisplayFilter(const VString &name);

  // Registration of what the plug-in provides. Each callback is a C++ function
  // or, announced by setRegisteringCallableScript() just before, a script
  // object in its place. A name or type id in use is refused with kFailure, a
  // missing name, type id or required callback with kInvalidParameter. Only
  // the plug-in that registered something can deregister it; unloading a
  // plug-in deregisters all it registered.

  // Commands share one namespace, whatever their kind.
  VStatus registerCommand(const VString &commandName, VCreatorFunction creatorFunction,
                          VCreateSyntaxFunction createSyntaxFunction = NULL);
  VStatus deregisterCommand(const VString &commandName);
  VStatus registerControlCommand(const VString &commandName, VCreatorFunction creatorFunction);
  VStatus deregisterControlCommand(const VString &commandName);
  VStatus registerModelEditorCommand(const VString &commandName, VCreatorFunction creatorFunction,
                                     VCreatorFunction paneCreatorFunction);
  VStatus deregisterModelEditorCommand(const VString &commandName);
  VStatus registerConstraintCommand(const VString &commandName, VCreatorFunction creatorFunction);
  VStatus deregisterConstraintCommand(const VString &commandName);
  VStatus registerContextCommand(const VString &contextCmdName, VCreatorFunction creatorFunction);
  // With the tool command that the context runs, registered under its own name.
  VStatus registerContextCommand(const VString &contextCmdName, VCreatorFunction creatorFunction,
                                 const VString &toolCmdName, VCreatorFunction toolCmdCreator,
                                 VCreateSyntaxFunction toolCmdSyntax);
  // Removes the context command with its tool command; a tool command name
  // given must be the one registered with it.
  VStatus deregisterContextCommand(const VString &contextCmdName);
  VStatus deregisterContextCommand(const VString &contextCmdName, const VString &toolCmdName);

  // Node and data types share one namespace of names and one of type ids.
  VStatus registerNode(const VString &typeName, const VTypeId &typeId,
                       VCreatorFunction creatorFunction, VInitializeFunction initFunction,
                       VPxNode::Type type = VPxNode::kDependNode,
                       const VString *classification = NULL);
  VStatus registerShape(const VString &typeName, const VTypeId &typeId,
                        VCreatorFunction creatorFunction, VInitializeFunction initFunction,
                        VCreatorFunction uiCreatorFunction, const VString *classification = NULL);
  VStatus registerShape(const VString &typeName, const VTypeId &typeId,
                        VCreatorFunction creatorFunction, VInitializeFunction initFunction,
                        const VString *classification = NULL);
  VStatus registerTransform(const VString &typeName, const VTypeId &typeId,
                            VCreatorFunction creatorFunction, VInitializeFunction initFunction,
                            VCreateXformMatrixFunction xformCreatorFunction, const VTypeId &xformId,
                            const VString *classification = NULL);
  // Removes a node, shape or transform type.
  VStatus deregisterNode(const VTypeId &typeId);
  VStatus registerData(const VString &typeName, const VTypeId &typeId,
                       VCreatorFunction creatorFunction, VPxData::Type type = VPxData::kData);
  VStatus deregisterData(const VTypeId &typeId);

  VStatus registerDevice(const VString &deviceName, VCreatorFunction creatorFunction);
  VStatus deregisterDevice(const VString &deviceName);
  VStatus registerIkSolver(const VString &ikSolverName, VCreatorFunction creatorFunction);
  VStatus deregisterIkSolver(const VString &ikSolverName);
  VStatus registerCacheFormat(const VString &cacheFormatName, VCreatorFunction creatorFunction);
  VStatus deregisterCacheFormat(const VString &cacheFormatName);
  VStatus registerDragAndDropBehavior(const VString &behaviorName,
                                      VCreatorFunction creatorFunction);
  VStatus deregisterDragAndDropBehavior(const VString &behaviorName);
  VStatus registerAttributePatternFactory(const VString &factoryName,
                                          VCreatorFunction factoryCreator);
  VStatus deregisterAttributePatternFactory(const VString &factoryName);
  VStatus registerRenderer(const VString &rendererName, VCreatorFunction creatorFunction);
  VStatus deregisterRenderer(const VString &rendererName);
  VStatus registerMaterialInfo(const VString &materialType,
                               VCreateMaterialInfoFunction creatorFunction);
  VStatus deregisterMaterialInfo(const VString &materialType);
  VStatus registerBakeEngine(const VString &typeName, VCreateBakeEngineFunction creatorFunction);
  VStatus deregisterBakeEngine(const VString &typeName);
  // Evaluators are known by name and by an id unique among evaluators.
  VStatus registerEvaluator(const VString &evaluatorName, unsigned int uniqueId,
                            VCustomEvaluatorCreatorFunction creatorFunction);
  VStatus unregisterEvaluator(const VString &evaluatorName);
  VStatus registerTopologyEvaluator(const VString &evaluatorName, unsigned int uniqueId,
                                    VTopologyEvaluatorCreatorFunction creatorFunction);
  VStatus unregisterTopologyEvaluator(const VString &evaluatorName);

  // pixmapName, optionsScriptName and defaultOptionsString may be NULL.
  VStatus registerFileTranslator(const VString &translatorName, const char *pixmapName,
                                 VCreatorFunction creatorFunction,
                                 const char *optionsScriptName = NULL,
                                 const char *defaultOptionsString = NULL,
                                 bool requiresFullScript = false,
                                 const VString &dataStorageLocation = kDefaultDataLocation);
  VStatus deregisterFileTranslator(const VString &translatorName);
  VStatus registerURIFileResolver(const VString &fileResolverName, const VString &uriScheme,
                                  VCreatorFunction creatorFunction);
  VStatus deregisterURIFileResolver(const VString &fileResolverName);
  // The plug-in's string resources, registered by the function given, and the
  // script procedure that localizes them; once per plug-in.
  VStatus registerUIStrings(VInitializeFunction registerStringResources,
                            const VString &pluginStringsProcName);
  VStatus registerImageFile(const VString &imageFormatName, VCreatorFunction creatorFunction,
                            const VStringArray &imageFileExtensions,
                            ImageFilePriority priority = kImageFilePriorityDefault);
  VStatus deregisterImageFile(const VString &imageFormatName);
  // With overrideExisting, replaces a pass implementation of the same id.
  VStatus registerRenderPassImpl(const VString &passImplId, VRenderPassDef *passDef,
                                 VCreatorFunction creatorFunction, bool overrideExisting = false);
  VStatus deregisterRenderPassImpl(const VString &passImplId);
  // Interpolators are known by name and by a type id unique among them.
  VStatus registerAnimCurveInterpolator(const VString &typeName, int typeId,
                                        VCreatorFunction creatorFunction, int flags = 0);
  VStatus deregisterAnimCurveInterpolator(const VString &typeName);

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
