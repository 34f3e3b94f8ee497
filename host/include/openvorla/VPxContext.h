// Base class of plug-in interaction contexts.
//
// The host calls the event members while the context is the current tool;
// by default they accept the event and do nothing.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VDoubleArray.h>
#include <openvorla/VEvent.h>
#include <openvorla/VIntArray.h>
#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VSyntax.h>

#include <vector>

OPENVORLA_NAMESPACE_OPEN

class VCursor;
class VPxToolCommand;
namespace VHWRender {
class VUIDrawManager;
}

class OPENVORLA_EXPORT VPxContext {
public:
  enum ImageIndex {
    kImage1,
    kImage2,
    kImage3
  };

  VPxContext();
  // With the title the host shows while the context is current.
  explicit VPxContext(const VString &titleString);
  virtual ~VPxContext();

  virtual void toolOnSetup(VEvent &event);
  virtual void toolOffCleanup();
  virtual VStatus doPress(VEvent &event);
  virtual VStatus doRelease(VEvent &event);
  virtual VStatus doDrag(VEvent &event);
  virtual VStatus doHold(VEvent &event);
  virtual VStatus doPtrMoved(VEvent &event);
  virtual VStatus doEnterRegion(VEvent &event);
  virtual VStatus helpStateHasChanged(VEvent &event);
  virtual void deleteAction();
  virtual void completeAction();
  virtual void abortAction();

  // Numeric input typed in while the context is current: the kind of each
  // value (kNoArg by default: the context takes none), their handling (false:
  // not handled) and whether the context shows the values it uses.
  virtual VSyntax::VArgType argTypeNumericalInput(unsigned int index) const;
  virtual bool processNumericalInput(const VDoubleArray &values, const VIntArray &flags,
                                     bool isAbsolute);
  virtual bool feedbackNumericalInput() const;

  // The class name the host shows and stores for the context; "" by default.
  virtual VString stringClassName() const;
  // A new tool command for the context to run, owned by the caller; null by
  // default: the context runs none.
  virtual VPxToolCommand *newToolCommand();

  VStatus setTitleString(const VString &title);
  VString titleString() const;
  VStatus setHelpString(const VString &help);
  VString helpString() const;
  // The icons of the context; kInvalidParameter for an index out of range.
  VStatus setImage(const VString &image, ImageIndex index);
  VString image(ImageIndex index, VStatus *ReturnStatus = NULL) const;
  // Whether numeric input entry is to be ignored: the user gave no value for
  // it (its flag is non-zero) or there is no such entry.
  bool ignoreEntry(const VIntArray &flags, unsigned int entry) const;
  // The manipulators the context shows; kInvalidParameter for the null object.
  VStatus addManipulator(const VObject &manipulator);
  VStatus deleteManipulators();
  unsigned int manipulatorCount() const;
  static const char *className();

protected:
  // The active selection changed while the context is current; does nothing
  // by default.
  virtual void selectionChanged();
  // Draws the context's feedback in the view being drawn; draws nothing and
  // reports kSuccess by default.
  virtual VStatus drawFeedback(VHWRender::VUIDrawManager &drawManager);
  // Makes the manipulators for a node of the selection, with addManipulator();
  // makes none and reports kSuccess by default.
  virtual VStatus updateManipulators(const VObject &node);
  // The cursor the host shows over the views while the context is current.
  VStatus setCursor(const VCursor &cursor);

private:
  VString fTitle;
  VString fHelp;
  VString fImages[3];
  std::vector<VObject> fManipulators;
};

OPENVORLA_NAMESPACE_CLOSE
