// VFnPlugin: the members that register and deregister what a plug-in provides.
#include <openvorla/VFnPlugin.h>

#include "PluginRegistry.h"

OPENVORLA_NAMESPACE_OPEN

namespace {

using K = RegistrationKind;
using R = CallbackRole;

// Takes the announcement back at once, also when the registration is going to
// be refused, so that it cannot leak into the next one.
RegistrationPtr start(RegistrationKind kind, const VString &name) {
  return std::make_shared<Registration>(kind, name, VFnPlugin::registeringCallableScript());
}

VStatus withdraw(const VObject &plugin, const Removal &kinds, const VString &name) {
  return withdrawRegistration(
      plugin, [&](Released &released) { return registry::remove(plugin, kinds, name, released); });
}

VStatus withdraw(const VObject &plugin, const Removal &kinds, const VTypeId &typeId) {
  return withdrawRegistration(plugin, [&](Released &released) {
    return registry::remove(plugin, kinds, typeId.id(), released);
  });
}

// Registrations of a name and a creator, the most common form.
template <typename Creator>
VStatus registerCreator(const VObject &plugin, RegistrationKind kind, const VString &name,
                        Creator creator) {
  RegistrationPtr r = start(kind, name);
  r->add(R::kCreator, creator);
  return submitRegistration(plugin, r);
}

RegistrationPtr startType(RegistrationKind kind, const VString &typeName, const VTypeId &typeId,
                          VCreatorFunction creator, VInitializeFunction init,
                          const VString *classification) {
  RegistrationPtr r = start(kind, typeName);
  r->typeId = typeId.id();
  r->add(R::kCreator, creator);
  r->add(R::kInitializer, init);
  if (classification) r->classification = *classification;
  return r;
}

}  // namespace

VStatus VFnPlugin::registerCommand(const VString &commandName, VCreatorFunction creatorFunction,
                                   VCreateSyntaxFunction createSyntaxFunction) {
  RegistrationPtr r = start(K::kCommand, commandName);
  r->add(R::kCreator, creatorFunction);
  r->add(R::kSyntaxCreator, createSyntaxFunction);
  return submitRegistration(object(), r);
}

VStatus VFnPlugin::deregisterCommand(const VString &commandName) {
  return withdraw(object(), {K::kCommand}, commandName);
}

VStatus VFnPlugin::registerControlCommand(const VString &commandName,
                                          VCreatorFunction creatorFunction) {
  return registerCreator(object(), K::kControlCommand, commandName, creatorFunction);
}

VStatus VFnPlugin::deregisterControlCommand(const VString &commandName) {
  return withdraw(object(), {K::kControlCommand}, commandName);
}

VStatus VFnPlugin::registerModelEditorCommand(const VString &commandName,
                                              VCreatorFunction creatorFunction,
                                              VCreatorFunction paneCreatorFunction) {
  RegistrationPtr r = start(K::kModelEditorCommand, commandName);
  r->add(R::kCreator, creatorFunction);
  r->add(R::kPaneCreator, paneCreatorFunction);
  return submitRegistration(object(), r);
}

VStatus VFnPlugin::deregisterModelEditorCommand(const VString &commandName) {
  return withdraw(object(), {K::kModelEditorCommand}, commandName);
}

VStatus VFnPlugin::registerConstraintCommand(const VString &commandName,
                                             VCreatorFunction creatorFunction) {
  return registerCreator(object(), K::kConstraintCommand, commandName, creatorFunction);
}

VStatus VFnPlugin::deregisterConstraintCommand(const VString &commandName) {
  return withdraw(object(), {K::kConstraintCommand}, commandName);
}

VStatus VFnPlugin::registerContextCommand(const VString &contextCmdName,
                                          VCreatorFunction creatorFunction) {
  return registerCreator(object(), K::kContextCommand, contextCmdName, creatorFunction);
}

VStatus VFnPlugin::registerContextCommand(const VString &contextCmdName,
                                          VCreatorFunction creatorFunction,
                                          const VString &toolCmdName,
                                          VCreatorFunction toolCmdCreator,
                                          VCreateSyntaxFunction toolCmdSyntax) {
  RegistrationPtr r = start(K::kContextCommand, contextCmdName);
  r->secondName = toolCmdName;
  r->add(R::kCreator, creatorFunction);
  r->add(R::kToolCommandCreator, toolCmdCreator);
  r->add(R::kSyntaxCreator, toolCmdSyntax);
  return submitRegistration(object(), r);
}

VStatus VFnPlugin::deregisterContextCommand(const VString &contextCmdName) {
  VObject plugin = object();
  return withdrawRegistration(plugin, [&](Released &released) {
    return registry::removeContextCommand(plugin, contextCmdName, nullptr, released);
  });
}

VStatus VFnPlugin::deregisterContextCommand(const VString &contextCmdName,
                                            const VString &toolCmdName) {
  VObject plugin = object();
  return withdrawRegistration(plugin, [&](Released &released) {
    return registry::removeContextCommand(plugin, contextCmdName, &toolCmdName, released);
  });
}

VStatus VFnPlugin::registerNode(const VString &typeName, const VTypeId &typeId,
                                VCreatorFunction creatorFunction, VInitializeFunction initFunction,
                                VPxNode::Type type, const VString *classification) {
  RegistrationPtr r =
      startType(K::kNode, typeName, typeId, creatorFunction, initFunction, classification);
  r->flags = type;
  if (type < VPxNode::kDependNode || type >= VPxNode::kLast)
    return VStatus(VStatus::kInvalidParameter, "The node type's kind is not a VPxNode::Type");
  return submitRegistration(object(), r);
}

VStatus VFnPlugin::registerShape(const VString &typeName, const VTypeId &typeId,
                                 VCreatorFunction creatorFunction, VInitializeFunction initFunction,
                                 VCreatorFunction uiCreatorFunction,
                                 const VString *classification) {
  RegistrationPtr r =
      startType(K::kShape, typeName, typeId, creatorFunction, initFunction, classification);
  r->flags = VPxNode::kSurfaceShape;
  r->add(R::kUICreator, uiCreatorFunction);
  return submitRegistration(object(), r);
}

VStatus VFnPlugin::registerShape(const VString &typeName, const VTypeId &typeId,
                                 VCreatorFunction creatorFunction, VInitializeFunction initFunction,
                                 const VString *classification) {
  return registerShape(typeName, typeId, creatorFunction, initFunction, NULL, classification);
}

VStatus VFnPlugin::registerTransform(const VString &typeName, const VTypeId &typeId,
                                     VCreatorFunction creatorFunction,
                                     VInitializeFunction initFunction,
                                     VCreateXformMatrixFunction xformCreatorFunction,
                                     const VTypeId &xformId, const VString *classification) {
  RegistrationPtr r =
      startType(K::kTransform, typeName, typeId, creatorFunction, initFunction, classification);
  r->flags = VPxNode::kTransformNode;
  r->add(R::kMatrixCreator, xformCreatorFunction);
  r->secondTypeId = xformId.id();
  return submitRegistration(object(), r);
}

VStatus VFnPlugin::deregisterNode(const VTypeId &typeId) {
  return withdraw(object(), {K::kNode, K::kShape, K::kTransform}, typeId);
}

VStatus VFnPlugin::registerData(const VString &typeName, const VTypeId &typeId,
                                VCreatorFunction creatorFunction, VPxData::Type type) {
  RegistrationPtr r = start(K::kData, typeName);
  r->typeId = typeId.id();
  r->flags = type;
  r->add(R::kCreator, creatorFunction);
  if (type < VPxData::kData || type >= VPxData::kLast)
    return VStatus(VStatus::kInvalidParameter, "The data type's kind is not a VPxData::Type");
  return submitRegistration(object(), r);
}

VStatus VFnPlugin::deregisterData(const VTypeId &typeId) {
  return withdraw(object(), {K::kData}, typeId);
}

VStatus VFnPlugin::registerDevice(const VString &deviceName, VCreatorFunction creatorFunction) {
  return registerCreator(object(), K::kDevice, deviceName, creatorFunction);
}

VStatus VFnPlugin::deregisterDevice(const VString &deviceName) {
  return withdraw(object(), {K::kDevice}, deviceName);
}

VStatus VFnPlugin::registerIkSolver(const VString &ikSolverName, VCreatorFunction creatorFunction) {
  return registerCreator(object(), K::kIkSolver, ikSolverName, creatorFunction);
}

VStatus VFnPlugin::deregisterIkSolver(const VString &ikSolverName) {
  return withdraw(object(), {K::kIkSolver}, ikSolverName);
}

VStatus VFnPlugin::registerCacheFormat(const VString &cacheFormatName,
                                       VCreatorFunction creatorFunction) {
  return registerCreator(object(), K::kCacheFormat, cacheFormatName, creatorFunction);
}

VStatus VFnPlugin::deregisterCacheFormat(const VString &cacheFormatName) {
  return withdraw(object(), {K::kCacheFormat}, cacheFormatName);
}

VStatus VFnPlugin::registerDragAndDropBehavior(const VString &behaviorName,
                                               VCreatorFunction creatorFunction) {
  return registerCreator(object(), K::kDragAndDropBehavior, behaviorName, creatorFunction);
}

VStatus VFnPlugin::deregisterDragAndDropBehavior(const VString &behaviorName) {
  return withdraw(object(), {K::kDragAndDropBehavior}, behaviorName);
}

VStatus VFnPlugin::registerAttributePatternFactory(const VString &factoryName,
                                                   VCreatorFunction factoryCreator) {
  return registerCreator(object(), K::kAttributePatternFactory, factoryName, factoryCreator);
}

VStatus VFnPlugin::deregisterAttributePatternFactory(const VString &factoryName) {
  return withdraw(object(), {K::kAttributePatternFactory}, factoryName);
}

VStatus VFnPlugin::registerRenderer(const VString &rendererName, VCreatorFunction creatorFunction) {
  return registerCreator(object(), K::kRenderer, rendererName, creatorFunction);
}

VStatus VFnPlugin::deregisterRenderer(const VString &rendererName) {
  return withdraw(object(), {K::kRenderer}, rendererName);
}

VStatus VFnPlugin::registerMaterialInfo(const VString &materialType,
                                        VCreateMaterialInfoFunction creatorFunction) {
  return registerCreator(object(), K::kMaterialInfo, materialType, creatorFunction);
}

VStatus VFnPlugin::deregisterMaterialInfo(const VString &materialType) {
  return withdraw(object(), {K::kMaterialInfo}, materialType);
}

VStatus VFnPlugin::registerBakeEngine(const VString &typeName,
                                      VCreateBakeEngineFunction creatorFunction) {
  return registerCreator(object(), K::kBakeEngine, typeName, creatorFunction);
}

VStatus VFnPlugin::deregisterBakeEngine(const VString &typeName) {
  return withdraw(object(), {K::kBakeEngine}, typeName);
}

VStatus VFnPlugin::registerEvaluator(const VString &evaluatorName, unsigned int uniqueId,
                                     VCustomEvaluatorCreatorFunction creatorFunction) {
  RegistrationPtr r = start(K::kEvaluator, evaluatorName);
  r->typeId = uniqueId;
  r->add(R::kCreator, creatorFunction);
  return submitRegistration(object(), r);
}

VStatus VFnPlugin::unregisterEvaluator(const VString &evaluatorName) {
  return withdraw(object(), {K::kEvaluator}, evaluatorName);
}

VStatus VFnPlugin::registerTopologyEvaluator(const VString &evaluatorName, unsigned int uniqueId,
                                             VTopologyEvaluatorCreatorFunction creatorFunction) {
  RegistrationPtr r = start(K::kTopologyEvaluator, evaluatorName);
  r->typeId = uniqueId;
  r->add(R::kCreator, creatorFunction);
  return submitRegistration(object(), r);
}

VStatus VFnPlugin::unregisterTopologyEvaluator(const VString &evaluatorName) {
  return withdraw(object(), {K::kTopologyEvaluator}, evaluatorName);
}

VStatus VFnPlugin::registerFileTranslator(const VString &translatorName, const char *,
                                          VCreatorFunction creatorFunction, const char *,
                                          const char *defaultOptionsString,
                                          bool requiresFullScript,
                                          const VString &dataStorageLocation) {
  RegistrationPtr r = start(K::kFileTranslator, translatorName);
  r->secondName = dataStorageLocation;
  if (defaultOptionsString) r->defaultOptions = defaultOptionsString;
  r->flags = requiresFullScript;
  r->add(R::kCreator, creatorFunction);
  return submitRegistration(object(), r);
}

VStatus VFnPlugin::deregisterFileTranslator(const VString &translatorName) {
  return withdraw(object(), {K::kFileTranslator}, translatorName);
}

VStatus VFnPlugin::registerURIFileResolver(const VString &fileResolverName,
                                           const VString &uriScheme,
                                           VCreatorFunction creatorFunction) {
  RegistrationPtr r = start(K::kURIFileResolver, fileResolverName);
  r->secondName = uriScheme;
  r->add(R::kCreator, creatorFunction);
  if (uriScheme.length() == 0)
    return VStatus(VStatus::kInvalidParameter, "A URI file resolver needs a URI scheme");
  return submitRegistration(object(), r);
}

VStatus VFnPlugin::deregisterURIFileResolver(const VString &fileResolverName) {
  return withdraw(object(), {K::kURIFileResolver}, fileResolverName);
}

VStatus VFnPlugin::registerUIStrings(VInitializeFunction registerStringResources,
                                     const VString &pluginStringsProcName) {
  RegistrationPtr r = start(K::kUIStrings, pluginStringsProcName);
  r->add(R::kStringRegistration, registerStringResources);
  return submitRegistration(object(), r);
}

VStatus VFnPlugin::registerImageFile(const VString &imageFormatName,
                                     VCreatorFunction creatorFunction,
                                     const VStringArray &imageFileExtensions,
                                     ImageFilePriority priority) {
  RegistrationPtr r = start(K::kImageFile, imageFormatName);
  r->flags = priority;
  r->add(R::kCreator, creatorFunction);
  if (imageFileExtensions.length() == 0)
    return VStatus(VStatus::kInvalidParameter, "An image file format needs a file extension");
  return submitRegistration(object(), r);
}

VStatus VFnPlugin::deregisterImageFile(const VString &imageFormatName) {
  return withdraw(object(), {K::kImageFile}, imageFormatName);
}

VStatus VFnPlugin::registerRenderPassImpl(const VString &passImplId, VRenderPassDef *,
                                          VCreatorFunction creatorFunction, bool overrideExisting) {
  RegistrationPtr r = start(K::kRenderPassImpl, passImplId);
  r->overrideExisting = overrideExisting;
  r->flags = overrideExisting;
  r->add(R::kCreator, creatorFunction);
  return submitRegistration(object(), r);
}

VStatus VFnPlugin::deregisterRenderPassImpl(const VString &passImplId) {
  return withdraw(object(), {K::kRenderPassImpl}, passImplId);
}

VStatus VFnPlugin::registerAnimCurveInterpolator(const VString &typeName, int typeId,
                                                 VCreatorFunction creatorFunction, int flags) {
  RegistrationPtr r = start(K::kAnimCurveInterpolator, typeName);
  r->typeId = static_cast<unsigned int>(typeId);
  r->flags = flags;
  r->add(R::kCreator, creatorFunction);
  return submitRegistration(object(), r);
}

VStatus VFnPlugin::deregisterAnimCurveInterpolator(const VString &typeName) {
  return withdraw(object(), {K::kAnimCurveInterpolator}, typeName);
}

OPENVORLA_NAMESPACE_CLOSE
