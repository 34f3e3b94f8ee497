// Self-test of the node proxy classes' host defaults and of the value classes
// they pass: what a plug-in that overrides nothing gets from the host.
#include <openvorla/VColor.h>
#include <openvorla/VDataBlock.h>
#include <openvorla/VFnPlugin.h>
#include <openvorla/VItGeometry.h>
#include <openvorla/VManipData.h>
#include <openvorla/VPxBlendShape.h>
#include <openvorla/VPxComponentShape.h>
#include <openvorla/VPxConstraint.h>
#include <openvorla/VPxDeformerNode.h>
#include <openvorla/VPxEmitterNode.h>
#include <openvorla/VPxFieldNode.h>
#include <openvorla/VPxFluidEmitterNode.h>
#include <openvorla/VPxHardwareShader.h>
#include <openvorla/VPxHwShaderNode.h>
#include <openvorla/VPxIkSolverNode.h>
#include <openvorla/VPxImagePlane.h>
#include <openvorla/VPxLocatorNode.h>
#include <openvorla/VPxManipContainer.h>
#include <openvorla/VPxManipulatorNode.h>
#include <openvorla/VPxMotionPathNode.h>
#include <openvorla/VPxObjectSet.h>
#include <openvorla/VPxParticleAttributeMapperNode.h>
#include <openvorla/VPxPolyTrg.h>
#include <openvorla/VPxSpringNode.h>
#include <openvorla/VPxSurfaceShape.h>
#include <openvorla/VStringArray.h>

#include <standin/Objects.h>

#include <cmath>

#include "selftest.h"

using namespace OPENVORLA_NAMESPACE;

namespace {

bool near(double a, double b) { return std::fabs(a - b) < 1e-9; }

class Solver : public VPxIkSolverNode {};

// A constraint that answers its protected queries, as derived ones do.
class Constraint : public VPxConstraint {
 public:
  VObject passive() const { return passiveOutputAttribute(); }
};

void testValueClasses() {
  VPointArray points(2, VPoint(1, 2, 3));
  CHECK(points.length() == 2 && points[1] == VPoint(1, 2, 3));
  CHECK(points.set(VPoint(), 2) == VStatus::kInvalidParameter && points.remove(5).error());
  CHECK(points.setLength(3) && points[2] == VPoint() && points != VPointArray());
  VVectorArray vectors;
  CHECK(vectors.append(VVector(0, 1, 0)) && vectors.length() == 1 && vectors[0].y == 1);

  VItGeometry none;
  CHECK(none.isDone() && none.count() == 0 && none.next() == VStatus::kFailure);
  VStatus status;
  CHECK(none.position(&status) == VPoint() && status == VStatus::kFailure);
  CHECK(none.setPosition(VPoint(1, 1, 1)) == VStatus::kFailure);

  VItGeometry it(points);
  int visited = 0;
  for (; !it.isDone(); it.next(), ++visited) it.setPosition(VPoint(visited, 0, 0));
  CHECK(visited == 3 && it.next() == VStatus::kFailure);
  VPointArray moved;
  it.allPositions(moved);
  CHECK(moved[2] == VPoint(2, 0, 0) && points[2] == VPoint());
  CHECK(it.setAllPositions(VPointArray()) == VStatus::kInvalidParameter);
  CHECK(it.reset() && it.index() == 0 && it.position() == VPoint(0, 0, 0));

  CHECK(VManipData().isSimple() && VManipData().asDouble() == 0);
  CHECK(VManipData(true).asLong() == 1 && VManipData(-2.5).asUnsigned() == 0);
  VObject data = standin::makeObject(VFn::kData, "curve");
  VManipData object(data);
  CHECK(!object.isSimple() && object.asVObject() == data && !object.asBool());
  CHECK(VColor() == VColor(0, 0, 0, 1) && VColor(1, 0, 0) != VColor(1, 0, 0, 0.5f));
}

void testShapesAndDeformers() {
  VPxComponentShape shape;
  VPxSurfaceShape &base = shape;
  CHECK(base.isRenderable() && base.setRenderable(false) && !base.isRenderable());
  VPoint closest(5, 5, 5);
  base.closestPoint(VPoint(1, 2, 3), closest);
  CHECK(closest == VPoint());
  VVector normal;
  CHECK(!base.closestPoint(VPoint(), VVector(0, 0, 1), closest, normal, true));
  // Without a context the plain form decides.
  CHECK(!base.validateAndSetValue(VPlug(), VDataHandle(), VDGContext()));
  base.transformUsing(VMatrix(), VObjectArray());
  base.weightedTransformUsing(VTransformationMatrix(), nullptr, VObjectArray(),
                              VPxSurfaceShape::kSavePoints, nullptr, nullptr);
  CHECK(base.renderGroupComponentType() == VFn::kInvalid && !base.hasActiveComponents());
  CHECK(std::string(VPxComponentShape::className()) == "VPxComponentShape");

  VPxDeformerNode deformer;
  VDataBlock block;
  VItGeometry it;
  CHECK(deformer.type() == VPxNode::kDeformerNode && deformer.getDeformationDetails() == 0);
  CHECK(deformer.deform(block, it, VMatrix(), 0) == VStatus::kNotImplemented);
  CHECK(deformer.setDeformationDetails(VPxGeometryFilter::kDeformsAll) &&
        deformer.getDeformationDetails() == 6);
  CHECK(deformer.setDeformationDetails(1) == VStatus::kInvalidParameter &&
        deformer.getDeformationDetails() == 6);
  CHECK(deformer.inputShapeAttribute() == VPxGeometryFilter::inputGeom &&
        deformer.outputShapeAttribute() == VPxGeometryFilter::outputGeom);
  CHECK(deformer.accessoryAttribute().isNull() && deformer.weightValue(block, 0, 7) == 1.0f);
  VPxBlendShape blend;
  CHECK(blend.deformData(block, VDataHandle(), 0, VMatrix(), 0) == VStatus::kNotImplemented);

  unsigned short triangles[3];
  float vertices[9] = {0};
  int loops[1] = {3};
  CHECK(VPxPolyTrg::triangulate("fan", vertices, vertices, loops, 1, 1, triangles) ==
        VStatus::kNotFound);
  CHECK(VPxPolyTrg::triangulate(nullptr, nullptr, nullptr, nullptr, 0, 0, nullptr) ==
        VStatus::kInvalidParameter);
  CHECK(VPxPolyTrg::unregisterTrgFunction(nullptr) == VStatus::kInvalidParameter);
}

void testSolversAndConstraints() {
  Solver solver;
  CHECK(!solver.isSingleChainOnly() && !solver.rotatePlane() && solver.maxIterations() == 100);
  solver.setSingleChainOnly(true);
  solver.setRotatePlane(true);
  solver.setMaxIterations(7);
  CHECK(solver.isSingleChainOnly() && solver.rotatePlane() && solver.maxIterations() == 7);
  CHECK(solver.doSolve() == VStatus::kNotImplemented && solver.solverTypeName() == "");
  CHECK(solver.postSolve(VStatus::kFailure) == VStatus::kFailure);

  VDoubleArray angles(6, 0.5);
  CHECK(solver.setJointAngles(angles) && solver.jointCount() == 2);
  CHECK(solver.setJointAngle(5, 2.0) && solver.jointAngle(5) == 2.0);
  CHECK(solver.setJointAngle(6, 1.0) == VStatus::kInvalidParameter && solver.jointAngle(6) == 0);
  solver.setToRestAngles();
  VDoubleArray rest;
  CHECK(solver.getJointAngles(rest) && rest.length() == 6 && rest[5] == 0.0);
  CHECK(solver.handleGroup() == nullptr && solver.currentHandle().isNull());

  Constraint constraint;
  CHECK(constraint.weightAttribute().isNull() && constraint.passive().isNull());

  VPxMotionPathNode path;
  VDataBlock block;
  block.outputValue(VPxMotionPathNode::uValue).setDouble(0.25);
  CHECK(path.position(block) == VPoint(0.25, 0, 0));
  CHECK(path.matrix(block).translation() == VVector(0.25, 0, 0));
  CHECK(near(path.wraparoundFractionalValue(1.25), 0.25) &&
        near(path.wraparoundParametricValue(-0.25), 0.75));
}

void testManipulators() {
  VPxManipContainer container;
  VDagPath triad = container.addFreePointTriadManip("move", "translate");
  CHECK(triad.isValid() && container.manipPath(0) == triad && !container.manipPath(1).isValid());
  CHECK(!container.addDiscManip("", "angle").isValid());
  CHECK(!container.addManip(static_cast<VPxManipContainer::ManipType>(42), "m", "a").isValid());
  CHECK(!container.addManip(VPxManipContainer::kCustomManip, "m", "noSuchType").isValid());
  VObject made;
  CHECK(container.addMPxManipulatorNode("noSuchType", "m", made) == VStatus::kInvalidParameter);
  VPlug plug;
  CHECK(container.addManipToPlugConversion(plug) == 0 &&
        container.addManipToPlugConversion(plug) == 1);
  double value = 3;
  CHECK(container.getConverterManipValue(0, value) == VStatus::kFailure && value == 3);
  CHECK(container.plugToManipConversion(0).isSimple());
  VTypeId id(0x7A300);
  CHECK(VPxManipContainer::removeFromManipConnectTable(id) == VStatus::kInvalidParameter);
  CHECK(VPxManipContainer::addToManipConnectTable(id) &&
        VPxManipContainer::removeFromManipConnectTable(id));

  VPxManipulatorNode manip;
  int distance = -1, point = -1, again = -1;
  CHECK(manip.addDoubleValue("distance", 2.0, distance) && distance == 0);
  CHECK(manip.addPointValue("point", VPoint(1, 2, 3), point) && point == 1);
  CHECK(manip.addVectorValue("distance", VVector(), again) == VStatus::kInvalidParameter &&
        again == -1);
  CHECK(manip.setDoubleValue(distance, 5.0));
  double now = 0, before = 0;
  CHECK(manip.getDoubleValue(distance, false, now) && now == 5.0);
  CHECK(manip.getDoubleValue(distance, true, before) && before == 2.0);
  VPoint where;
  CHECK(manip.getPointValue(point, false, where) && where == VPoint(1, 2, 3));
  CHECK(manip.setVectorValue(9, VVector()) == VStatus::kInvalidParameter);
  int plugIndex = -1;
  CHECK(manip.connectPlugToValue(VPlug(), point, plugIndex) == VStatus::kInvalidParameter);
  bool refresh = true;
  CHECK(manip.doMove(refresh) == VStatus::kUnknownParameter && !refresh);
  short x = 0, y = 0;
  CHECK(manip.mousePosition(x, y) == VStatus::kFailure);
  CHECK(manip.setInstancePtr(&container) && manip.getInstancePtr() == &container);
  CHECK(VPxManipulatorNode::newManipulator("noSuchType", made) == VStatus::kInvalidParameter);

  VPxLocatorNode locator;
  CHECK(locator.color(false) == VColor(1, 1, 1));
  locator.setColor(VColor(1, 0, 0), true);
  CHECK(locator.color(true) == VColor(1, 0, 0) && locator.color(false) == VColor(1, 1, 1));
  CHECK(locator.getShapeSelectionMask().intersects(VSelectionMask::kSelectLocators));
}

void testDynamicsAndShaders() {
  VPxSpringNode spring;
  VVector f1, f2;
  // Stretched by 1 with stiffness 2, the ends closing at speed 1 with damping 0.5.
  CHECK(spring.applySpringLaw(2, 0.5, 1, 1, 1, VVector(0, 0, 0), VVector(2, 0, 0), VVector(0, 0, 0),
                              VVector(-1, 0, 0), f1, f2));
  CHECK(near(f1.x, 1.5) && near(f2.x, -1.5) && f1.y == 0);
  CHECK(spring.applySpringLaw(1, 1, 1, 1, 1, VVector(), VVector(), VVector(), VVector(), f1, f2) &&
        f1 == VVector() && f2 == VVector());

  VPxEmitterNode emitter, twin;
  VDataBlock block;
  block.outputValue(VPxEmitterNode::mSeed).setInt(17);
  emitter.resetRandomState(0, block);
  twin.resetRandomState(0, block);
  double first = emitter.randgen();
  CHECK(first >= 0 && first < 1 && first == twin.randgen() && emitter.randgen() != first);
  emitter.setRandomState(0, block);
  twin.getRandomState(0, block);
  CHECK(emitter.randgen() == twin.randgen());
  VMatrix placed;
  placed.setTranslation(VVector(10, 0, 0));
  CHECK(emitter.volumePrimitivePointInside(VPoint(10.4, 0, 0), placed) &&
        !emitter.volumePrimitivePointInside(VPoint(0.4, 0, 0), placed));
  VStatus status = VStatus::kFailure;
  CHECK(!emitter.hasValidEmission2dTexture(VObject(), &status) && status);
  VDoubleArray u, v;
  CHECK(emitter.evalEmission2dTexture(VObject(), u, v, nullptr, nullptr) == VStatus::kFailure);

  VPxFluidEmitterNode fluid;
  block.outputValue(VPxFluidEmitterNode::mFluidColorG).setDouble(0.5);
  CHECK(fluid.fluidColor(block) == VColor(0, 0.5f, 0) &&
        fluid.type() == VPxNode::kFluidEmitterNode);

  VPxFieldNode field;
  double falloff = -1;
  CHECK(field.falloffCurve(0.25, falloff) && falloff == 0.75);
  CHECK(field.falloffCurve(3, falloff) && falloff == 0);
  unsigned int w = 9, h = 9, xo = 9, yo = 9;
  CHECK(field.iconSizeAndOrigin(w, h, xo, yo) && w == 0 && yo == 0 && field.iconBitmap(nullptr));

  VPxParticleAttributeMapperNode mapper;
  VDataBlock values;
  values.outputValue(VPxParticleAttributeMapperNode::uCoordPP).setDouble(0.5);
  values.outputValue(VPxParticleAttributeMapperNode::outMinValue).setDouble(2);
  values.outputValue(VPxParticleAttributeMapperNode::outMaxValue).setDouble(4);
  VObject node = standin::makeObject(VFn::kDependencyNode, "mapper1");
  CHECK(mapper.compute(VPlug(node, VPxParticleAttributeMapperNode::outValuePP), values));
  CHECK(values.inputValue(VPxParticleAttributeMapperNode::outValuePP).asDouble() == 3);
  CHECK(mapper.compute(VPlug(node, VPxParticleAttributeMapperNode::time), values) ==
        VStatus::kUnknownParameter);

  VPxHwShaderNode shader;
  CHECK(shader.geometry(VDagPath(), 0, 0, 0, nullptr, 0, nullptr, nullptr) ==
        VStatus::kNotImplemented);
  CHECK(shader.normalsPerVertex() == 1 && shader.dirtyMask() == VPxHwShaderNode::kDirtyAll);
  VObject object;
  CHECK(VPxHwShaderNode::getHwShaderNodePtr(object) == nullptr &&
        VPxHardwareShader::getHardwareShaderPtr(object) == nullptr);
}

// Every new default, called as a host would with default-constructed values
// and null pointers: none may crash, and each answers "not handled".
void testDefaultsTakeEmptyArguments() {
  VDataBlock block;
  VObject object;
  VObjectArray objects;
  VPlug plug;
  VMatrix matrix;
  VSelectionList list;
  VDagPath path;
  VStringArray names;

  VPxSurfaceShape shape;
  VDoubleArray undo;
  VVectorArray directions;
  CHECK(!shape.deleteComponents(objects, undo) && !shape.undeleteComponents(objects, undo));
  CHECK(!shape.vertexOffsetDirection(object, directions) && !shape.convertToTweakNodePlug(plug));
  shape.componentToPlugs(object, list);
  shape.transformUsing(matrix, objects, VPxSurfaceShape::kRestorePoints, nullptr);
  CHECK(shape.newControlPointComponent().isNull() && shape.createFullRenderGroup().isNull());
  CHECK(!shape.excludeAsPluginShape() && !shape.canMakeLive() && list.isEmpty());

  VPxImagePlane plane;
  CHECK(plane.exactImageFile() == "" && plane.setImageDirty() && plane.refreshImage());
  VPxObjectSet set;
  CHECK(set.canBeDeleted(false) && set.type() == VPxNode::kObjectSet);

  VPxGeometryFilter filter;
  CHECK(filter.setModifiedCallback(list, true) && filter.getInputGeom(block, 3).isNull());

  Solver solver;
  CHECK(solver.preSolve() && !solver.groupHandlesByTopology());
  CHECK(!solver.isAttributeCreatedBySolver(object));
  solver.snapHandle(object);
  solver.setHandleGroup(nullptr);
  CHECK(solver.setCurrentHandle(object) && solver.currentHandle().isNull());

  Constraint constraint;
  CHECK(constraint.targetAttribute().isNull() &&
        constraint.constraintRotateOrderAttribute().isNull());

  VPxLocatorNode locator;
  CHECK(!locator.isBounded() && locator.boundingBox().isEmpty() && !locator.isSelected(path));
  CHECK(locator.closestPoint(VPoint(), VVector()) == VPoint() && !locator.drawLast());

  VPxManipContainer container;
  CHECK(container.createChildren() && container.connectToDependNode(object));
  CHECK(container.doPress() == VStatus::kUnknownParameter &&
        !container.isManipActive(VFn::kBase, object));
  CHECK(container.manipToPlugConversion(3).asDouble() == 0);

  VPxManipulatorNode manip;
  CHECK(manip.connectToDependNode(object) && manip.addDependentPlug(plug).error());
  CHECK(manip.dependentPlugsReset() && !manip.shouldDraw(path) &&
        manip.getInstancePtr() == nullptr);

  VPxHwShaderNode shader;
  CHECK(shader.bind(path) == VStatus::kNotImplemented && shader.glUnbind(path).error());
  CHECK(shader.glGeometry(path, 0, 0, 0, nullptr, 0, nullptr, nullptr, 0, nullptr, 0, nullptr, 0,
                          nullptr) == VStatus::kNotImplemented);
  CHECK(shader.getColorSetNames(names) == 0 && shader.getTexCoordSetNames(names) == 0);
  CHECK(!shader.hasTransparency() && shader.transparencyOptions() == 0 && names.length() == 0);

  VPxHardwareShader hardware;
  CHECK(hardware.getAvailableImages("map1", names) == VStatus::kNotImplemented);
  CHECK(hardware.findResource("a.png", "") == "" && hardware.transparencyOptions() == 0);

  VPxEmitterNode emitter;
  VVectorArray positions(2, VVector(1, 1, 1));
  CHECK(emitter.getOwnerPositions(block, positions) && positions.length() == 0);
  CHECK(emitter.getOwnerShape().isNull() && emitter.getRate(block) == 0);

  VPxFieldNode field;
  VVectorArray force;
  CHECK(field.getForceAtPoint(VPointArray(), VVectorArray(), VDoubleArray(), force, 0.04) ==
        VStatus::kNotImplemented);
  CHECK(!field.drawIcon() && !field.isFalloffCurveConstantOne());

  VPxFluidEmitterNode fluid;
  CHECK(fluid.fluidEmitter(object, matrix, 0) == VStatus::kNotImplemented);
  CHECK(!fluid.hasEmissionFunction(block) && fluid.turbulence(block) == 0);
}

}  // namespace

void testNodeClasses() {
  testValueClasses();
  testShapesAndDeformers();
  testSolversAndConstraints();
  testManipulators();
  testDynamicsAndShaders();
  testDefaultsTakeEmptyArguments();
}
