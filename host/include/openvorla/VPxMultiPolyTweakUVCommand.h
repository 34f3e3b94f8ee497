// Base class of plug-in commands that move the UVs of several meshes.
//
// As VPxPolyTweakUVCommand, with preProcessUVs() called once before the host
// asks getTweakedUVs() mesh by mesh.
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

class OPENVORLA_EXPORT VPxMultiPolyTweakUVCommand : public VPxCommand {
public:
  VPxMultiPolyTweakUVCommand();
  ~VPxMultiPolyTweakUVCommand() override;

  // Reads the command's own flags; kSuccess by default: it has none.
  virtual VStatus parseSyntax(VArgDatabase &argData);
  // Work common to all the meshes; kSuccess by default.
  virtual VStatus preProcessUVs();
  // kNotImplemented by default: no UVs of the mesh move.
  virtual VStatus getTweakedUVs(const VObject &meshObj, VIntArray &uvList, VFloatArray &uPos,
                                VFloatArray &vPos);

  // An optional UV set name (-uvs/-uvSetName) and one or more meshes.
  static VSyntax newSyntax();
};

OPENVORLA_NAMESPACE_CLOSE
