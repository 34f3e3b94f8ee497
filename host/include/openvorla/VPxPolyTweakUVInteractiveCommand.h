// Tool command that moves UVs interactively.
//
// The texture editor's tweak context makes the command when the user starts
// dragging UVs and gives it their positions with setUVs() as the drag goes
// on; finalize() records the move for undo and cancel() drops it.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VArgList.h>
#include <openvorla/VIntArray.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxToolCommand.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

#include <cstddef>

OPENVORLA_NAMESPACE_OPEN

class VFloatArray;

class OPENVORLA_EXPORT VPxPolyTweakUVInteractiveCommand : public VPxToolCommand {
public:
  VPxPolyTweakUVInteractiveCommand();
  ~VPxPolyTweakUVInteractiveCommand() override;

  VStatus doIt(const VArgList &args) override;
  // finalize() records the command line of the move; both report kFailure
  // until UVs were set.
  VStatus cancel() override;
  VStatus finalize() override;
  bool isUndoable() const override;  // true

  // The new positions of the listed UVs of the mesh, in its current UV set
  // or the one named, one in uPos and vPos per UV; kInvalidParameter for an
  // empty list.
  VStatus setUVs(const VObject &mesh, VIntArray &uvList, VFloatArray &uPos, VFloatArray &vPos,
                 const VString *uvSet = NULL);
  static const char *className();

private:
  unsigned int fMoved;
};

OPENVORLA_NAMESPACE_CLOSE
