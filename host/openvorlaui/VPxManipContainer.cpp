// VPxManipContainer: the manipulators a container adds, its conversions
// between manipulator and plug values, and the host's table of the node types
// that containers serve.
#include <openvorla/VFnPlugin.h>
#include <openvorla/VPxManipContainer.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

#include <algorithm>
#include <mutex>
#include <vector>

OPENVORLA_NAMESPACE_OPEN

namespace {

struct ConnectTable {
  std::mutex mutex;
  std::vector<unsigned int> ids;
};

ConnectTable &connectTable() {
  static ConnectTable table;
  return table;
}

// Values exist only while the host runs a conversion, which the stand-in never does.
VStatus noConversion() {
  return VStatus(VStatus::kFailure, "No manipulator conversion is running");
}

}  // namespace

VPxManipContainer::VPxManipContainer() : fPlugConversions(0) {
  standin::noteConstructed("VPxManipContainer");
}

VPxManipContainer::~VPxManipContainer() { standin::noteDestroyed("VPxManipContainer"); }

VPxNode::Type VPxManipContainer::type() const { return kManipContainer; }
VStatus VPxManipContainer::createChildren() { return VStatus::kSuccess; }
VStatus VPxManipContainer::connectToDependNode(const VObject &) { return VStatus::kSuccess; }
VStatus VPxManipContainer::finishAddingManips() { return VStatus::kSuccess; }
VManipData VPxManipContainer::plugToManipConversion(unsigned int) { return VManipData(); }
VManipData VPxManipContainer::manipToPlugConversion(unsigned int) { return VManipData(); }
VStatus VPxManipContainer::doPress() { return VStatus::kUnknownParameter; }
VStatus VPxManipContainer::doDrag() { return VStatus::kUnknownParameter; }
VStatus VPxManipContainer::doRelease() { return VStatus::kUnknownParameter; }

// Each manipulator is a new child object named after it; an unnamed one
// cannot be added.
VDagPath VPxManipContainer::addManipPath(const VString &manipName) {
  VDagPath path;
  if (manipName.length() == 0) return path;
  path.push(standin::makeObject(VFn::kDagNode, manipName.asUTF8()));
  fManips.push_back(path);
  return path;
}

VDagPath VPxManipContainer::addFreePointTriadManip(const VString &manipName, const VString &) {
  return addManipPath(manipName);
}
VDagPath VPxManipContainer::addDirectionManip(const VString &manipName, const VString &) {
  return addManipPath(manipName);
}
VDagPath VPxManipContainer::addDistanceManip(const VString &manipName, const VString &) {
  return addManipPath(manipName);
}
VDagPath VPxManipContainer::addPointOnCurveManip(const VString &manipName, const VString &) {
  return addManipPath(manipName);
}
VDagPath VPxManipContainer::addPointOnSurfaceManip(const VString &manipName, const VString &) {
  return addManipPath(manipName);
}
VDagPath VPxManipContainer::addDiscManip(const VString &manipName, const VString &) {
  return addManipPath(manipName);
}
VDagPath VPxManipContainer::addCircleSweepManip(const VString &manipName, const VString &) {
  return addManipPath(manipName);
}
VDagPath VPxManipContainer::addToggleManip(const VString &manipName, const VString &) {
  return addManipPath(manipName);
}
VDagPath VPxManipContainer::addStateManip(const VString &manipName, const VString &) {
  return addManipPath(manipName);
}
VDagPath VPxManipContainer::addCurveSegmentManip(const VString &manipName, const VString &,
                                                 const VString &) {
  return addManipPath(manipName);
}
VDagPath VPxManipContainer::addRotateManip(const VString &manipName, const VString &) {
  return addManipPath(manipName);
}
VDagPath VPxManipContainer::addScaleManip(const VString &manipName, const VString &) {
  return addManipPath(manipName);
}

VDagPath VPxManipContainer::addManip(ManipType type, const VString &manipName,
                                     const VString &attrName) {
  int kind = static_cast<int>(type);
  if (kind < kFreePointTriadManip || kind > kCustomManip) return VDagPath();
  if (type == kCustomManip && !VFnPlugin::isNodeRegistered(attrName)) return VDagPath();
  return addManipPath(manipName);
}

VStatus VPxManipContainer::addMPxManipulatorNode(const VString &manipTypeName,
                                                 const VString &manipName, VObject &manipObject) {
  if (!VFnPlugin::isNodeRegistered(manipTypeName))
    return VStatus(VStatus::kInvalidParameter, "No manipulator node type of that name");
  VDagPath path = addManipPath(manipName);
  if (!path.isValid()) return VStatus(VStatus::kInvalidParameter, "A manipulator needs a name");
  manipObject = path.node();
  return VStatus::kSuccess;
}

VDagPath VPxManipContainer::manipPath(unsigned int index) const {
  return index < fManips.size() ? fManips[index] : VDagPath();
}

void VPxManipContainer::addPlugToManipConversion(unsigned int) {}
unsigned int VPxManipContainer::addManipToPlugConversion(VPlug &) { return fPlugConversions++; }
VStatus VPxManipContainer::addPlugToInViewEditor(const VPlug &plug) {
  return plug.isNull() ? VStatus::kInvalidParameter : VStatus::kSuccess;
}

VStatus VPxManipContainer::getConverterManipValue(unsigned int, unsigned int &) {
  return noConversion();
}
VStatus VPxManipContainer::getConverterManipValue(unsigned int, double &) { return noConversion(); }
VStatus VPxManipContainer::getConverterManipValue(unsigned int, double &, double &) {
  return noConversion();
}
VStatus VPxManipContainer::getConverterManipValue(unsigned int, VPoint &) { return noConversion(); }
VStatus VPxManipContainer::getConverterManipValue(unsigned int, VVector &) {
  return noConversion();
}
VStatus VPxManipContainer::getConverterManipValue(unsigned int, VMatrix &) {
  return noConversion();
}
VStatus VPxManipContainer::getConverterManipValue(unsigned int, VEulerRotation &) {
  return noConversion();
}
VStatus VPxManipContainer::getConverterManipValue(unsigned int, VTransformationMatrix &) {
  return noConversion();
}
VStatus VPxManipContainer::getConverterPlugValue(unsigned int, double &) { return noConversion(); }
VStatus VPxManipContainer::getConverterPlugValue(unsigned int, VPoint &) { return noConversion(); }
VStatus VPxManipContainer::getConverterPlugValue(unsigned int, VVector &) { return noConversion(); }

bool VPxManipContainer::isManipActive(VFn::Type, VObject &) { return false; }

VStatus VPxManipContainer::addToManipConnectTable(VTypeId &id) {
  ConnectTable &t = connectTable();
  std::lock_guard<std::mutex> guard(t.mutex);
  if (std::find(t.ids.begin(), t.ids.end(), id.id()) == t.ids.end()) t.ids.push_back(id.id());
  return VStatus::kSuccess;
}

VStatus VPxManipContainer::removeFromManipConnectTable(VTypeId &id) {
  ConnectTable &t = connectTable();
  std::lock_guard<std::mutex> guard(t.mutex);
  auto it = std::find(t.ids.begin(), t.ids.end(), id.id());
  if (it == t.ids.end())
    return VStatus(VStatus::kInvalidParameter, "The node type is not in the table");
  t.ids.erase(it);
  return VStatus::kSuccess;
}

// The stand-in host makes nodes only through its graph, never manipulators.
VStatus VPxManipContainer::newManipulator(const VString &manipName, VObject &) {
  if (!VFnPlugin::isNodeRegistered(manipName))
    return VStatus(VStatus::kInvalidParameter, "No manipulator node type of that name");
  return VStatus(VStatus::kNotImplemented, "The host makes no manipulators");
}

const char *VPxManipContainer::className() { return "VPxManipContainer"; }

OPENVORLA_NAMESPACE_CLOSE
