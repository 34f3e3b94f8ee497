// Base class of plug-in commands that move the UVs of one mesh.
//
// The host parses the command's arguments with newSyntax(), hands them to
// parseSyntax() and asks getTweakedUVs() for the new positions of the UVs it
// moves, which it then applies, undoably, to the mesh.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VIntArray.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxCommand.h>
#include <openvorla/VStatus.h>
#include <openvorla/VSyntax.h>

OPENVORLA_NAMESPACE_OPEN

class VArgDatabase;
class VFloatArray;

class OPENVORLA_EXPORT VPxPolyTweakUVCommand : public VPxCommand {
public:
  VPxPolyTweakUVCommand();
  ~VPxPolyTweakUVCommand() override;

  // Reads the command's own flags; kSuccess by default: it has none.
  virtual VStatus parseSyntax(VArgDatabase &argData);
  // Fills uvList with the ids of the UVs of the mesh to move and uPos and vPos
  // with their new positions; kNotImplemented by default: none move.
  virtual VStatus getTweakedUVs(const VObject &meshObj, VIntArray &uvList, VFloatArray &uPos,
                                VFloatArray &vPos);

  // The syntax the host parses the command with: an optional UV set name
  // (-uvs/-uvSetName) and one mesh.
  static VSyntax newSyntax();
};

OPENVORLA_NAMESPACE_CLOSE
