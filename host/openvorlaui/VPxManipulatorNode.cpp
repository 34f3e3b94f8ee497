// VPxManipulatorNode: construction and the static attribute objects.
#include <openvorla/VPxManipulatorNode.h>

#include <openvorla/VFnPlugin.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

namespace {

// The stand-in has no views: no mouse and no picking.
VStatus noView() { return VStatus(VStatus::kFailure, "The manipulator is not in a view"); }

VStatus noValue() { return VStatus(VStatus::kInvalidParameter, "No value of that index"); }

}  // namespace

VPxManipulatorNode::VPxManipulatorNode() : fContainer(nullptr), fMouseMove(false) {
  standin::noteConstructed("VPxManipulatorNode");
}

VPxManipulatorNode::~VPxManipulatorNode() { standin::noteDestroyed("VPxManipulatorNode"); }

VPxNode::Type VPxManipulatorNode::type() const { return kManipulatorNode; }
VStatus VPxManipulatorNode::doPress() { return VStatus::kUnknownParameter; }
VStatus VPxManipulatorNode::doDrag() { return VStatus::kUnknownParameter; }
VStatus VPxManipulatorNode::doRelease() { return VStatus::kUnknownParameter; }

VStatus VPxManipulatorNode::doMove(bool &refresh) {
  refresh = false;
  return VStatus::kUnknownParameter;
}

VStatus VPxManipulatorNode::connectToDependNode(const VObject &) { return VStatus::kSuccess; }
void VPxManipulatorNode::drawUI(VHWRender::VUIDrawManager &) const {}

VStatus VPxManipulatorNode::finishAddingManips() { return VStatus::kSuccess; }
VStatus VPxManipulatorNode::glFirstHandle(unsigned int &) { return noView(); }
VStatus VPxManipulatorNode::glActiveName(unsigned int &) { return noView(); }
VStatus VPxManipulatorNode::mouseRay(VPoint &, VVector &) const { return noView(); }
VStatus VPxManipulatorNode::mouseRayWorld(VPoint &, VVector &) const { return noView(); }
VStatus VPxManipulatorNode::mousePosition(short &, short &) { return noView(); }
VStatus VPxManipulatorNode::mouseDown(short &, short &) { return noView(); }
VStatus VPxManipulatorNode::mouseUp(short &, short &) { return noView(); }

VStatus VPxManipulatorNode::registerForMouseMove() {
  fMouseMove = true;
  return VStatus::kSuccess;
}

VStatus VPxManipulatorNode::deregisterForMouseMove() {
  fMouseMove = false;
  return VStatus::kSuccess;
}

// Every value is kept as a vector; a double uses its x, a point its
// cartesian coordinates. A name is taken once.
VStatus VPxManipulatorNode::addValue(const VString &name, const VVector &initial, int &index) {
  std::string key = name.asUTF8();
  if (key.empty()) return VStatus(VStatus::kInvalidParameter, "A value needs a name");
  for (const Value &v : fValues)
    if (v.name == key) return VStatus(VStatus::kInvalidParameter, "The value exists already");
  fValues.push_back(Value{key, initial, initial});
  index = static_cast<int>(fValues.size()) - 1;
  return VStatus::kSuccess;
}

VPxManipulatorNode::Value *VPxManipulatorNode::value(int index) {
  if (index < 0 || index >= static_cast<int>(fValues.size())) return nullptr;
  return &fValues[index];
}

VStatus VPxManipulatorNode::addDoubleValue(const VString &valueName, double defaultValue,
                                           int &valueIndex) {
  return addValue(valueName, VVector(defaultValue, 0.0, 0.0), valueIndex);
}

VStatus VPxManipulatorNode::addPointValue(const VString &valueName, const VPoint &defaultValue,
                                          int &valueIndex) {
  return addValue(valueName, defaultValue.asVector(), valueIndex);
}

VStatus VPxManipulatorNode::addVectorValue(const VString &valueName, const VVector &defaultValue,
                                           int &valueIndex) {
  return addValue(valueName, defaultValue, valueIndex);
}

VStatus VPxManipulatorNode::setDoubleValue(int valueIndex, double value) {
  return setVectorValue(valueIndex, VVector(value, 0.0, 0.0));
}

VStatus VPxManipulatorNode::setPointValue(int valueIndex, const VPoint &value) {
  return setVectorValue(valueIndex, value.asVector());
}

VStatus VPxManipulatorNode::setVectorValue(int valueIndex, const VVector &value) {
  Value *v = this->value(valueIndex);
  if (!v) return noValue();
  v->previous = v->current;
  v->current = value;
  return VStatus::kSuccess;
}

VStatus VPxManipulatorNode::getDoubleValue(int valueIndex, bool previousValue, double &value) {
  VVector vector;
  VStatus status = getVectorValue(valueIndex, previousValue, vector);
  if (status) value = vector.x;
  return status;
}

VStatus VPxManipulatorNode::getPointValue(int valueIndex, bool previousValue, VPoint &value) {
  VVector vector;
  VStatus status = getVectorValue(valueIndex, previousValue, vector);
  if (status) value = VPoint(vector);
  return status;
}

VStatus VPxManipulatorNode::getVectorValue(int valueIndex, bool previousValue, VVector &value) {
  Value *v = this->value(valueIndex);
  if (!v) return noValue();
  value = previousValue ? v->previous : v->current;
  return VStatus::kSuccess;
}

VStatus VPxManipulatorNode::connectPlugToValue(const VPlug &plug, int valueIndex, int &plugIndex) {
  if (!value(valueIndex)) return noValue();
  if (plug.isNull()) return VStatus(VStatus::kInvalidParameter, "The plug is null");
  fConnections.push_back(plug);
  plugIndex = static_cast<int>(fConnections.size()) - 1;
  return VStatus::kSuccess;
}

VStatus VPxManipulatorNode::addDependentPlug(const VPlug &plug) {
  if (plug.isNull()) return VStatus(VStatus::kInvalidParameter, "The plug is null");
  fDependents.push_back(plug);
  return VStatus::kSuccess;
}

VStatus VPxManipulatorNode::dependentPlugsReset() {
  fDependents.clear();
  return VStatus::kSuccess;
}

// The host's palette indices for manipulators.
short VPxManipulatorNode::mainColor() { return 6; }
short VPxManipulatorNode::xColor() { return 13; }
short VPxManipulatorNode::yColor() { return 14; }
short VPxManipulatorNode::zColor() { return 6; }
short VPxManipulatorNode::prevColor() { return 1; }
short VPxManipulatorNode::lineColor() { return 16; }
short VPxManipulatorNode::dimmedColor() { return 2; }
short VPxManipulatorNode::selectedColor() { return 17; }
short VPxManipulatorNode::labelColor() { return 16; }
short VPxManipulatorNode::labelBackgroundColor() { return 1; }

void VPxManipulatorNode::setHandleColor(unsigned int, short) {}
bool VPxManipulatorNode::shouldDraw(const VDagPath &path) const { return path.isValid(); }

VStatus VPxManipulatorNode::setInstancePtr(VPxManipContainer *manip) {
  fContainer = manip;
  return VStatus::kSuccess;
}

VPxManipContainer *VPxManipulatorNode::getInstancePtr() { return fContainer; }

// The stand-in host makes nodes only through its graph, never manipulators.
VStatus VPxManipulatorNode::newManipulator(const VString &manipName, VObject &) {
  if (!VFnPlugin::isNodeRegistered(manipName))
    return VStatus(VStatus::kInvalidParameter, "No manipulator node type of that name");
  return VStatus(VStatus::kNotImplemented, "The host makes no manipulators");
}

const char *VPxManipulatorNode::className() { return "VPxManipulatorNode"; }

VObject VPxManipulatorNode::connectedNodes =
    standin::makeAttribute("VPxManipulatorNode.connectedNodes");

OPENVORLA_NAMESPACE_CLOSE
