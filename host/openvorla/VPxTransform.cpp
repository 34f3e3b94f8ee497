// VPxTransform: construction and the static attribute objects.
#include <openvorla/VPxTransform.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxTransform::VPxTransform() { standin::noteConstructed("VPxTransform"); }
VPxTransform::~VPxTransform() { standin::noteDestroyed("VPxTransform"); }

VObject VPxTransform::nodeBoundingBox = standin::makeAttribute("VPxTransform.nodeBoundingBox");
VObject VPxTransform::nodeBoundingBoxMin =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxMin");
VObject VPxTransform::nodeBoundingBoxMinX =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxMinX");
VObject VPxTransform::nodeBoundingBoxMinY =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxMinY");
VObject VPxTransform::nodeBoundingBoxMinZ =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxMinZ");
VObject VPxTransform::nodeBoundingBoxMax =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxMax");
VObject VPxTransform::nodeBoundingBoxMaxX =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxMaxX");
VObject VPxTransform::nodeBoundingBoxMaxY =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxMaxY");
VObject VPxTransform::nodeBoundingBoxMaxZ =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxMaxZ");
VObject VPxTransform::nodeBoundingBoxSize =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxSize");
VObject VPxTransform::nodeBoundingBoxSizeX =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxSizeX");
VObject VPxTransform::nodeBoundingBoxSizeY =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxSizeY");
VObject VPxTransform::nodeBoundingBoxSizeZ =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxSizeZ");
VObject VPxTransform::center = standin::makeAttribute("VPxTransform.center");
VObject VPxTransform::boundingBoxCenterX =
    standin::makeAttribute("VPxTransform.boundingBoxCenterX");
VObject VPxTransform::boundingBoxCenterY =
    standin::makeAttribute("VPxTransform.boundingBoxCenterY");
VObject VPxTransform::boundingBoxCenterZ =
    standin::makeAttribute("VPxTransform.boundingBoxCenterZ");
VObject VPxTransform::matrix = standin::makeAttribute("VPxTransform.matrix");
VObject VPxTransform::inverseMatrix = standin::makeAttribute("VPxTransform.inverseMatrix");
VObject VPxTransform::worldMatrix = standin::makeAttribute("VPxTransform.worldMatrix");
VObject VPxTransform::worldInverseMatrix =
    standin::makeAttribute("VPxTransform.worldInverseMatrix");
VObject VPxTransform::parentMatrix = standin::makeAttribute("VPxTransform.parentMatrix");
VObject VPxTransform::parentInverseMatrix =
    standin::makeAttribute("VPxTransform.parentInverseMatrix");
VObject VPxTransform::visibility = standin::makeAttribute("VPxTransform.visibility");
VObject VPxTransform::intermediateObject =
    standin::makeAttribute("VPxTransform.intermediateObject");
VObject VPxTransform::isTemplated = standin::makeAttribute("VPxTransform.isTemplated");
VObject VPxTransform::ghosting = standin::makeAttribute("VPxTransform.ghosting");
VObject VPxTransform::instObjGroups = standin::makeAttribute("VPxTransform.instObjGroups");
VObject VPxTransform::objectGroups = standin::makeAttribute("VPxTransform.objectGroups");
VObject VPxTransform::objectGrpCompList = standin::makeAttribute("VPxTransform.objectGrpCompList");
VObject VPxTransform::objectGroupId = standin::makeAttribute("VPxTransform.objectGroupId");
VObject VPxTransform::objectGroupColor = standin::makeAttribute("VPxTransform.objectGroupColor");
VObject VPxTransform::useObjectColor = standin::makeAttribute("VPxTransform.useObjectColor");
VObject VPxTransform::objectColor = standin::makeAttribute("VPxTransform.objectColor");
VObject VPxTransform::drawOverride = standin::makeAttribute("VPxTransform.drawOverride");
VObject VPxTransform::overrideDisplayType =
    standin::makeAttribute("VPxTransform.overrideDisplayType");
VObject VPxTransform::overrideLevelOfDetail =
    standin::makeAttribute("VPxTransform.overrideLevelOfDetail");
VObject VPxTransform::overrideShading = standin::makeAttribute("VPxTransform.overrideShading");
VObject VPxTransform::overrideTexturing = standin::makeAttribute("VPxTransform.overrideTexturing");
VObject VPxTransform::overridePlayback = standin::makeAttribute("VPxTransform.overridePlayback");
VObject VPxTransform::overrideEnabled = standin::makeAttribute("VPxTransform.overrideEnabled");
VObject VPxTransform::overrideVisibility =
    standin::makeAttribute("VPxTransform.overrideVisibility");
VObject VPxTransform::overrideColor = standin::makeAttribute("VPxTransform.overrideColor");
VObject VPxTransform::lodVisibility = standin::makeAttribute("VPxTransform.lodVisibility");
VObject VPxTransform::renderInfo = standin::makeAttribute("VPxTransform.renderInfo");
VObject VPxTransform::identification = standin::makeAttribute("VPxTransform.identification");
VObject VPxTransform::layerRenderable = standin::makeAttribute("VPxTransform.layerRenderable");
VObject VPxTransform::layerOverrideColor =
    standin::makeAttribute("VPxTransform.layerOverrideColor");
VObject VPxTransform::renderLayerInfo = standin::makeAttribute("VPxTransform.renderLayerInfo");
VObject VPxTransform::renderLayerId = standin::makeAttribute("VPxTransform.renderLayerId");
VObject VPxTransform::renderLayerRenderable =
    standin::makeAttribute("VPxTransform.renderLayerRenderable");
VObject VPxTransform::renderLayerColor = standin::makeAttribute("VPxTransform.renderLayerColor");
VObject VPxTransform::translate = standin::makeAttribute("VPxTransform.translate");
VObject VPxTransform::translateX = standin::makeAttribute("VPxTransform.translateX");
VObject VPxTransform::translateY = standin::makeAttribute("VPxTransform.translateY");
VObject VPxTransform::translateZ = standin::makeAttribute("VPxTransform.translateZ");
VObject VPxTransform::rotate = standin::makeAttribute("VPxTransform.rotate");
VObject VPxTransform::rotateX = standin::makeAttribute("VPxTransform.rotateX");
VObject VPxTransform::rotateY = standin::makeAttribute("VPxTransform.rotateY");
VObject VPxTransform::rotateZ = standin::makeAttribute("VPxTransform.rotateZ");
VObject VPxTransform::rotateOrder = standin::makeAttribute("VPxTransform.rotateOrder");
VObject VPxTransform::scale = standin::makeAttribute("VPxTransform.scale");
VObject VPxTransform::scaleX = standin::makeAttribute("VPxTransform.scaleX");
VObject VPxTransform::scaleY = standin::makeAttribute("VPxTransform.scaleY");
VObject VPxTransform::scaleZ = standin::makeAttribute("VPxTransform.scaleZ");
VObject VPxTransform::shear = standin::makeAttribute("VPxTransform.shear");
VObject VPxTransform::shearXY = standin::makeAttribute("VPxTransform.shearXY");
VObject VPxTransform::shearXZ = standin::makeAttribute("VPxTransform.shearXZ");
VObject VPxTransform::shearYZ = standin::makeAttribute("VPxTransform.shearYZ");
VObject VPxTransform::rotatePivot = standin::makeAttribute("VPxTransform.rotatePivot");
VObject VPxTransform::rotatePivotX = standin::makeAttribute("VPxTransform.rotatePivotX");
VObject VPxTransform::rotatePivotY = standin::makeAttribute("VPxTransform.rotatePivotY");
VObject VPxTransform::rotatePivotZ = standin::makeAttribute("VPxTransform.rotatePivotZ");
VObject VPxTransform::rotatePivotTranslate =
    standin::makeAttribute("VPxTransform.rotatePivotTranslate");
VObject VPxTransform::rotatePivotTranslateX =
    standin::makeAttribute("VPxTransform.rotatePivotTranslateX");
VObject VPxTransform::rotatePivotTranslateY =
    standin::makeAttribute("VPxTransform.rotatePivotTranslateY");
VObject VPxTransform::rotatePivotTranslateZ =
    standin::makeAttribute("VPxTransform.rotatePivotTranslateZ");
VObject VPxTransform::scalePivot = standin::makeAttribute("VPxTransform.scalePivot");
VObject VPxTransform::scalePivotX = standin::makeAttribute("VPxTransform.scalePivotX");
VObject VPxTransform::scalePivotY = standin::makeAttribute("VPxTransform.scalePivotY");
VObject VPxTransform::scalePivotZ = standin::makeAttribute("VPxTransform.scalePivotZ");
VObject VPxTransform::scalePivotTranslate =
    standin::makeAttribute("VPxTransform.scalePivotTranslate");
VObject VPxTransform::scalePivotTranslateX =
    standin::makeAttribute("VPxTransform.scalePivotTranslateX");
VObject VPxTransform::scalePivotTranslateY =
    standin::makeAttribute("VPxTransform.scalePivotTranslateY");
VObject VPxTransform::scalePivotTranslateZ =
    standin::makeAttribute("VPxTransform.scalePivotTranslateZ");
VObject VPxTransform::rotateAxis = standin::makeAttribute("VPxTransform.rotateAxis");
VObject VPxTransform::rotateAxisX = standin::makeAttribute("VPxTransform.rotateAxisX");
VObject VPxTransform::rotateAxisY = standin::makeAttribute("VPxTransform.rotateAxisY");
VObject VPxTransform::rotateAxisZ = standin::makeAttribute("VPxTransform.rotateAxisZ");
VObject VPxTransform::transMinusRotatePivot =
    standin::makeAttribute("VPxTransform.transMinusRotatePivot");
VObject VPxTransform::transMinusRotatePivotX =
    standin::makeAttribute("VPxTransform.transMinusRotatePivotX");
VObject VPxTransform::transMinusRotatePivotY =
    standin::makeAttribute("VPxTransform.transMinusRotatePivotY");
VObject VPxTransform::transMinusRotatePivotZ =
    standin::makeAttribute("VPxTransform.transMinusRotatePivotZ");
VObject VPxTransform::minTransLimit = standin::makeAttribute("VPxTransform.minTransLimit");
VObject VPxTransform::minTransXLimit = standin::makeAttribute("VPxTransform.minTransXLimit");
VObject VPxTransform::minTransYLimit = standin::makeAttribute("VPxTransform.minTransYLimit");
VObject VPxTransform::minTransZLimit = standin::makeAttribute("VPxTransform.minTransZLimit");
VObject VPxTransform::maxTransLimit = standin::makeAttribute("VPxTransform.maxTransLimit");
VObject VPxTransform::maxTransXLimit = standin::makeAttribute("VPxTransform.maxTransXLimit");
VObject VPxTransform::maxTransYLimit = standin::makeAttribute("VPxTransform.maxTransYLimit");
VObject VPxTransform::maxTransZLimit = standin::makeAttribute("VPxTransform.maxTransZLimit");
VObject VPxTransform::minTransLimitEnable =
    standin::makeAttribute("VPxTransform.minTransLimitEnable");
VObject VPxTransform::minTransXLimitEnable =
    standin::makeAttribute("VPxTransform.minTransXLimitEnable");
VObject VPxTransform::minTransYLimitEnable =
    standin::makeAttribute("VPxTransform.minTransYLimitEnable");
VObject VPxTransform::minTransZLimitEnable =
    standin::makeAttribute("VPxTransform.minTransZLimitEnable");
VObject VPxTransform::maxTransLimitEnable =
    standin::makeAttribute("VPxTransform.maxTransLimitEnable");
VObject VPxTransform::maxTransXLimitEnable =
    standin::makeAttribute("VPxTransform.maxTransXLimitEnable");
VObject VPxTransform::maxTransYLimitEnable =
    standin::makeAttribute("VPxTransform.maxTransYLimitEnable");
VObject VPxTransform::maxTransZLimitEnable =
    standin::makeAttribute("VPxTransform.maxTransZLimitEnable");
VObject VPxTransform::minRotLimit = standin::makeAttribute("VPxTransform.minRotLimit");
VObject VPxTransform::minRotXLimit = standin::makeAttribute("VPxTransform.minRotXLimit");
VObject VPxTransform::minRotYLimit = standin::makeAttribute("VPxTransform.minRotYLimit");
VObject VPxTransform::minRotZLimit = standin::makeAttribute("VPxTransform.minRotZLimit");
VObject VPxTransform::maxRotLimit = standin::makeAttribute("VPxTransform.maxRotLimit");
VObject VPxTransform::maxRotXLimit = standin::makeAttribute("VPxTransform.maxRotXLimit");
VObject VPxTransform::maxRotYLimit = standin::makeAttribute("VPxTransform.maxRotYLimit");
VObject VPxTransform::maxRotZLimit = standin::makeAttribute("VPxTransform.maxRotZLimit");
VObject VPxTransform::minRotLimitEnable = standin::makeAttribute("VPxTransform.minRotLimitEnable");
VObject VPxTransform::minRotXLimitEnable =
    standin::makeAttribute("VPxTransform.minRotXLimitEnable");
VObject VPxTransform::minRotYLimitEnable =
    standin::makeAttribute("VPxTransform.minRotYLimitEnable");
VObject VPxTransform::minRotZLimitEnable =
    standin::makeAttribute("VPxTransform.minRotZLimitEnable");
VObject VPxTransform::maxRotLimitEnable = standin::makeAttribute("VPxTransform.maxRotLimitEnable");
VObject VPxTransform::maxRotXLimitEnable =
    standin::makeAttribute("VPxTransform.maxRotXLimitEnable");
VObject VPxTransform::maxRotYLimitEnable =
    standin::makeAttribute("VPxTransform.maxRotYLimitEnable");
VObject VPxTransform::maxRotZLimitEnable =
    standin::makeAttribute("VPxTransform.maxRotZLimitEnable");
VObject VPxTransform::minScaleLimit = standin::makeAttribute("VPxTransform.minScaleLimit");
VObject VPxTransform::minScaleXLimit = standin::makeAttribute("VPxTransform.minScaleXLimit");
VObject VPxTransform::minScaleYLimit = standin::makeAttribute("VPxTransform.minScaleYLimit");
VObject VPxTransform::minScaleZLimit = standin::makeAttribute("VPxTransform.minScaleZLimit");
VObject VPxTransform::maxScaleLimit = standin::makeAttribute("VPxTransform.maxScaleLimit");
VObject VPxTransform::maxScaleXLimit = standin::makeAttribute("VPxTransform.maxScaleXLimit");
VObject VPxTransform::maxScaleYLimit = standin::makeAttribute("VPxTransform.maxScaleYLimit");
VObject VPxTransform::maxScaleZLimit = standin::makeAttribute("VPxTransform.maxScaleZLimit");
VObject VPxTransform::minScaleLimitEnable =
    standin::makeAttribute("VPxTransform.minScaleLimitEnable");
VObject VPxTransform::minScaleXLimitEnable =
    standin::makeAttribute("VPxTransform.minScaleXLimitEnable");
VObject VPxTransform::minScaleYLimitEnable =
    standin::makeAttribute("VPxTransform.minScaleYLimitEnable");
VObject VPxTransform::minScaleZLimitEnable =
    standin::makeAttribute("VPxTransform.minScaleZLimitEnable");
VObject VPxTransform::maxScaleLimitEnable =
    standin::makeAttribute("VPxTransform.maxScaleLimitEnable");
VObject VPxTransform::maxScaleXLimitEnable =
    standin::makeAttribute("VPxTransform.maxScaleXLimitEnable");
VObject VPxTransform::maxScaleYLimitEnable =
    standin::makeAttribute("VPxTransform.maxScaleYLimitEnable");
VObject VPxTransform::maxScaleZLimitEnable =
    standin::makeAttribute("VPxTransform.maxScaleZLimitEnable");
VObject VPxTransform::geometry = standin::makeAttribute("VPxTransform.geometry");
VObject VPxTransform::xformMatrix = standin::makeAttribute("VPxTransform.xformMatrix");
VObject VPxTransform::selectHandle = standin::makeAttribute("VPxTransform.selectHandle");
VObject VPxTransform::selectHandleX = standin::makeAttribute("VPxTransform.selectHandleX");
VObject VPxTransform::selectHandleY = standin::makeAttribute("VPxTransform.selectHandleY");
VObject VPxTransform::selectHandleZ = standin::makeAttribute("VPxTransform.selectHandleZ");
VObject VPxTransform::inheritsTransform = standin::makeAttribute("VPxTransform.inheritsTransform");
VObject VPxTransform::displayHandle = standin::makeAttribute("VPxTransform.displayHandle");
VObject VPxTransform::displayScalePivot = standin::makeAttribute("VPxTransform.displayScalePivot");
VObject VPxTransform::displayRotatePivot =
    standin::makeAttribute("VPxTransform.displayRotatePivot");
VObject VPxTransform::displayLocalAxis = standin::makeAttribute("VPxTransform.displayLocalAxis");
VObject VPxTransform::dynamics = standin::makeAttribute("VPxTransform.dynamics");
VObject VPxTransform::showManipDefault = standin::makeAttribute("VPxTransform.showManipDefault");
VObject VPxTransform::specifiedManipLocation =
    standin::makeAttribute("VPxTransform.specifiedManipLocation");
VObject VPxTransform::rotateQuaternion = standin::makeAttribute("VPxTransform.rotateQuaternion");
VObject VPxTransform::rotateQuaternionX = standin::makeAttribute("VPxTransform.rotateQuaternionX");
VObject VPxTransform::rotateQuaternionY = standin::makeAttribute("VPxTransform.rotateQuaternionY");
VObject VPxTransform::rotateQuaternionZ = standin::makeAttribute("VPxTransform.rotateQuaternionZ");
VObject VPxTransform::rotateQuaternionW = standin::makeAttribute("VPxTransform.rotateQuaternionW");
VObject VPxTransform::rotationInterpolation =
    standin::makeAttribute("VPxTransform.rotationInterpolation");
VObject VPxTransform::offsetParentMatrix =
    standin::makeAttribute("VPxTransform.offsetParentMatrix");

OPENVORLA_NAMESPACE_CLOSE
