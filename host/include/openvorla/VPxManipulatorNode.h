// Base class of plug-in manipulator nodes.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VDagPath.h>
#include <openvorla/VObject.h>
#include <openvorla/VPlug.h>
#include <openvorla/VPoint.h>
#include <openvorla/VPxManipContainer.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VVector.h>

#include <string>
#include <vector>

OPENVORLA_NAMESPACE_OPEN

namespace VHWRender {
class VUIDrawManager;
}

class OPENVORLA_EXPORT VPxManipulatorNode : public VPxNode {
public:
  VPxManipulatorNode();
  ~VPxManipulatorNode() override;

  VPxNode::Type type() const override;  // kManipulatorNode

  // The mouse on the manipulator: press, drag (or move without a button,
  // once registerForMouseMove was called; refresh asks for a redraw) and
  // release. kUnknownParameter: the host does nothing more.
  virtual VStatus doPress();
  virtual VStatus doDrag();
  virtual VStatus doRelease();
  virtual VStatus doMove(bool &refresh);
  // Ties the manipulator's values to the plugs of dependNode.
  virtual VStatus connectToDependNode(const VObject &dependNode);
  // Draws the manipulator with the host's drawing interface.
  virtual void drawUI(VHWRender::VUIDrawManager &drawManager) const;

  // Ends the additions of a manipulator made inside a container.
  VStatus finishAddingManips();
  // Names for picking: the first of the manipulator's handles, and the one
  // under the mouse.
  VStatus glFirstHandle(unsigned int &firstHandle);
  VStatus glActiveName(unsigned int &name);
  // The mouse: its ray in local or world space, and its position in the
  // view now, at the press and at the release.
  VStatus mouseRay(VPoint &linePoint, VVector &lineDirection) const;
  VStatus mouseRayWorld(VPoint &linePoint, VVector &lineDirection) const;
  VStatus mousePosition(short &x_pos, short &y_pos);
  VStatus mouseDown(short &x_pos, short &y_pos);
  VStatus mouseUp(short &x_pos, short &y_pos);
  VStatus registerForMouseMove();
  VStatus deregisterForMouseMove();

  // The manipulator's values: added once by name, each with an index; the
  // get forms read the value now or before the drag (previousValue).
  VStatus addDoubleValue(const VString &valueName, double defaultValue, int &valueIndex);
  VStatus addPointValue(const VString &valueName, const VPoint &defaultValue, int &valueIndex);
  VStatus addVectorValue(const VString &valueName, const VVector &defaultValue, int &valueIndex);
  VStatus setDoubleValue(int valueIndex, double value);
  VStatus setPointValue(int valueIndex, const VPoint &value);
  VStatus setVectorValue(int valueIndex, const VVector &value);
  VStatus getDoubleValue(int valueIndex, bool previousValue, double &value);
  VStatus getPointValue(int valueIndex, bool previousValue, VPoint &value);
  VStatus getVectorValue(int valueIndex, bool previousValue, VVector &value);
  // Connects plug to the value valueIndex; plugIndex numbers the connection.
  VStatus connectPlugToValue(const VPlug &plug, int valueIndex, int &plugIndex);
  // Plugs whose change redraws the manipulator.
  VStatus addDependentPlug(const VPlug &plug);
  VStatus dependentPlugsReset();

  // The host's color indices for drawing manipulators.
  short mainColor();
  short xColor();
  short yColor();
  short zColor();
  short prevColor();
  short lineColor();
  short dimmedColor();
  short selectedColor();
  short labelColor();
  short labelBackgroundColor();
  // Draws the handle glName in colorIndex from now on.
  void setHandleColor(unsigned int glName, short colorIndex);
  // Whether the host should draw the manipulator for the object at path.
  bool shouldDraw(const VDagPath &path) const;

  // The container the manipulator belongs to; null for a free one.
  VStatus setInstancePtr(VPxManipContainer *manip);
  VPxManipContainer *getInstancePtr();
  // Makes a manipulator of the registered type manipName into manipObject.
  static VStatus newManipulator(const VString &manipName, VObject &manipObject);
  static const char *className();

  static VObject connectedNodes;

private:
  struct Value {
    std::string name;
    VVector current;
    VVector previous;
  };
  VStatus addValue(const VString &name, const VVector &value, int &index);
  Value *value(int index);

  std::vector<Value> fValues;
  std::vector<VPlug> fConnections;
  std::vector<VPlug> fDependents;
  VPxManipContainer *fContainer;
  bool fMouseMove;
};

OPENVORLA_NAMESPACE_CLOSE
