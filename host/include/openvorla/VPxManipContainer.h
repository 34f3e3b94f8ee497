// Base class of plug-in containers of manipulators.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VDagPath.h>
#include <openvorla/VEulerRotation.h>
#include <openvorla/VFn.h>
#include <openvorla/VManipData.h>
#include <openvorla/VMatrix.h>
#include <openvorla/VObject.h>
#include <openvorla/VPlug.h>
#include <openvorla/VPoint.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VTransformationMatrix.h>
#include <openvorla/VTypeId.h>
#include <openvorla/VVector.h>

#include <vector>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxManipContainer : public VPxNode {
public:
  enum ManipType {
    kFreePointTriadManip,
    kDirectionManip,
    kDistanceManip,
    kPointOnCurveManip,
    kPointOnSurfaceManip,
    kDiscManip,
    kCircleSweepManip,
    kToggleManip,
    kStateManip,
    kCurveSegmentManip,
    kCustomManip
  };

  VPxManipContainer();
  ~VPxManipContainer() override;

  VPxNode::Type type() const override;  // kManipContainer

  // Adds the container's manipulators (add...Manip); called once, after the
  // container is made. finishAddingManips ends the additions and
  // connectToDependNode ties the manipulators to the node they edit.
  virtual VStatus createChildren();
  virtual VStatus connectToDependNode(const VObject &node);
  virtual VStatus finishAddingManips();
  // The conversions that addPlugToManipConversion and
  // addManipToPlugConversion announced: the value of manipulator manipIndex
  // from the plugs, and the value of plug plugIndex from the manipulators.
  // The number 0 by default.
  virtual VManipData plugToManipConversion(unsigned int manipIndex);
  virtual VManipData manipToPlugConversion(unsigned int plugIndex);
  // The mouse on the container's manipulators; kUnknownParameter: the
  // manipulators handle it.
  virtual VStatus doPress();
  virtual VStatus doDrag();
  virtual VStatus doRelease();

  // The standard manipulators, named manipName, editing the attribute of the
  // second name; each returns the manipulator's path (empty on failure).
  VDagPath addFreePointTriadManip(const VString &manipName, const VString &pointName);
  VDagPath addDirectionManip(const VString &manipName, const VString &directionName);
  VDagPath addDistanceManip(const VString &manipName, const VString &distanceName);
  VDagPath addPointOnCurveManip(const VString &manipName, const VString &paramName);
  VDagPath addPointOnSurfaceManip(const VString &manipName, const VString &paramName);
  VDagPath addDiscManip(const VString &manipName, const VString &angleName);
  VDagPath addCircleSweepManip(const VString &manipName, const VString &angleName);
  VDagPath addToggleManip(const VString &manipName, const VString &toggleName);
  VDagPath addStateManip(const VString &manipName, const VString &stateName);
  VDagPath addCurveSegmentManip(const VString &manipName, const VString &startParamName,
                                const VString &endParamName);
  VDagPath addRotateManip(const VString &manipName, const VString &rotationName);
  VDagPath addScaleManip(const VString &manipName, const VString &scaleName);
  // Any of them by its type; kCustomManip adds the plug-in manipulator node
  // type named attrName.
  VDagPath addManip(ManipType type, const VString &manipName, const VString &attrName);
  // A plug-in manipulator node of the registered type manipTypeName, made
  // into manipObject.
  VStatus addMPxManipulatorNode(const VString &manipTypeName, const VString &manipName,
                                VObject &manipObject);
  // The path of the manipulator added index-th; empty past the last.
  VDagPath manipPath(unsigned int index) const;

  // Announces a conversion: plugToManipConversion(manipIndex) then gives the
  // manipulator's value, and manipToPlugConversion(the returned index) the
  // plug's.
  void addPlugToManipConversion(unsigned int manipIndex);
  unsigned int addManipToPlugConversion(VPlug &plug);
  VStatus addPlugToInViewEditor(const VPlug &plug);
  // Inside a conversion: the current value of a manipulator, or of a plug.
  VStatus getConverterManipValue(unsigned int manipIndex, unsigned int &value);
  VStatus getConverterManipValue(unsigned int manipIndex, double &value);
  VStatus getConverterManipValue(unsigned int manipIndex, double &x, double &y);
  VStatus getConverterManipValue(unsigned int manipIndex, VPoint &point);
  VStatus getConverterManipValue(unsigned int manipIndex, VVector &vector);
  VStatus getConverterManipValue(unsigned int manipIndex, VMatrix &matrix);
  VStatus getConverterManipValue(unsigned int manipIndex, VEulerRotation &rotation);
  VStatus getConverterManipValue(unsigned int manipIndex, VTransformationMatrix &xform);
  VStatus getConverterPlugValue(unsigned int plugIndex, double &value);
  VStatus getConverterPlugValue(unsigned int plugIndex, VPoint &point);
  VStatus getConverterPlugValue(unsigned int plugIndex, VVector &vector);
  // Whether the active manipulator is of manipType, and which it is.
  bool isManipActive(VFn::Type manipType, VObject &manipObject);

  // The node types whose manipulators the host shows with this container.
  static VStatus addToManipConnectTable(VTypeId &id);
  static VStatus removeFromManipConnectTable(VTypeId &id);
  // Makes a container of the registered type manipName into manipObject.
  static VStatus newManipulator(const VString &manipName, VObject &manipObject);
  static const char *className();

private:
  VDagPath addManipPath(const VString &manipName);

  std::vector<VDagPath> fManips;
  unsigned int fPlugConversions;
};

OPENVORLA_NAMESPACE_CLOSE
