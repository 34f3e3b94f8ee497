// Base class of plug-in contexts that select objects.
//
// The context selects as the host's selection tool does: a press starts a
// pick or a marquee at the pointer, dragging stretches the marquee and the
// release ends it. The allow* settings say which of the host's selection
// helpers apply while the context is current; all are on by default except
// soft selection and symmetry.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VEvent.h>
#include <openvorla/VPxContext.h>
#include <openvorla/VStatus.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxSelectionContext : public VPxContext {
public:
  VPxSelectionContext();
  ~VPxSelectionContext() override;

  VStatus doPress(VEvent &event) override;
  VStatus doRelease(VEvent &event) override;
  VStatus doDrag(VEvent &event) override;
  VStatus doHold(VEvent &event) override;
  VStatus doPtrMoved(VEvent &event) override;
  // Both end a selection in progress without selecting.
  void abortAction() override;
  void toolOffCleanup() override;

  VStatus setAllowPreselectHilite(bool allow);
  bool allowPreselectHilite() const;
  VStatus setAllowSoftSelect(bool allow);
  bool allowSoftSelect() const;
  VStatus setAllowSymmetry(bool allow);
  bool allowSymmetry() const;
  VStatus setAllowSnapping(bool allow);
  bool allowSnapping() const;
  VStatus setAllowActivateSelectedObject(bool allow);
  bool allowActivateSelectedObject() const;
  VStatus setAllowDoubleClickAction(bool allow);
  bool allowDoubleClickAction() const;

  // Whether a press started a selection that no release ended yet.
  bool isSelecting() const;
  // Where that press was, and where the pointer was last dragged to (the
  // press while it was not dragged); kFailure when there was no press.
  VStatus startPoint(short &x, short &y) const;
  VStatus lastDragPoint(short &x, short &y) const;
  static const char *className();

protected:
  // Whether the selection in progress was dragged away from its start: a
  // marquee rather than a pick.
  bool isMarquee() const;

private:
  bool fPreselectHilite;
  bool fSoftSelect;
  bool fSymmetry;
  bool fSnapping;
  bool fActivateSelectedObject;
  bool fDoubleClickAction;
  bool fPressed;
  bool fSelecting;
  short fStartX;
  short fStartY;
  short fLastX;
  short fLastY;
};

OPENVORLA_NAMESPACE_CLOSE
