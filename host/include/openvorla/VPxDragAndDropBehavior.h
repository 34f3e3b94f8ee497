// Base class of plug-in drag-and-drop behaviours.
//
// When the user drops a node on another, or on one of its attributes, the
// host asks each registered behaviour whether it handles the pair and lets
// the first that does connect them; the behaviour's connect member matching
// what was dropped on what is called. force is set when the user asked to
// replace existing connections. By default a behaviour handles nothing and
// connects nothing (kNotImplemented).
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPlug.h>
#include <openvorla/VStatus.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxDragAndDropBehavior {
public:
  VPxDragAndDropBehavior();
  virtual ~VPxDragAndDropBehavior();

  static const char *className();

protected:
  virtual bool shouldBeUsedFor(VObject &sourceNode, VObject &destinationNode, VPlug &sourcePlug,
                               VPlug &destinationPlug);
  virtual VStatus connectAttrToAttr(VPlug &sourcePlug, VPlug &destinationPlug, bool force);
  virtual VStatus connectAttrToNode(VPlug &sourcePlug, VObject &destinationNode, bool force);
  virtual VStatus connectNodeToAttr(VObject &sourceNode, VPlug &destinationPlug, bool force);
  virtual VStatus connectNodeToNode(VObject &sourceNode, VObject &destinationNode, bool force);
};

OPENVORLA_NAMESPACE_CLOSE
