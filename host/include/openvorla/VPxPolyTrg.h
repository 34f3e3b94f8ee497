// Base class of plug-in polygon triangulators.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxNode.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxPolyTrg : public VPxNode {
public:
  VPxPolyTrg();
  ~VPxPolyTrg() override;

  // The node type only carries the triangulation functions; users never
  // make nodes of it.
  void postConstructor() override;
  bool isAbstractClass() const override;  // true

  // Triangulates one face with the function registered under name: the
  // face's loops (loopSizes, nbLoop of them) of vertices and normals (three
  // floats each) into nbTrg triangles of vertex indices in trg. kNotFound
  // when no function of that name is registered.
  static VStatus triangulate(const char *name, const float *vert, const float *norm,
                             const int *loopSizes, int nbLoop, int nbTrg, unsigned short *trg);
  static VStatus unregisterTrgFunction(const char *name);
  static const char *className();
};

OPENVORLA_NAMESPACE_CLOSE
