// Base class of plug-in hardware shader nodes.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VDagPath.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VStatus.h>
#include <openvorla/VStringArray.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxHwShaderNode : public VPxNode {
public:
  enum WriteMask {
    kWriteNone = 0,
    kWriteVertexArray = 1,
    kWriteNormalArray = 2,
    kWriteColorArrays = 4,
    kWriteTexCoordArrays = 8,
    kWriteAll = 15
  };

  enum DirtyMask {
    kDirtyNone = 0,
    kDirtyVertexArray = 1,
    kDirtyNormalArray = 2,
    kDirtyColorArrays = 4,
    kDirtyTexCoordArrays = 8,
    kDirtyAll = 15
  };

  enum TransparencyOptions {
    kIsTransparent = 1,
    kNoTransparencyFrontBackCull = 2,
    kNoTransparencyPolygonSort = 4
  };

  VPxHwShaderNode();
  ~VPxHwShaderNode() override;

  VPxNode::Type type() const override;  // kHwShaderNode

  // Drawing a shape with the shader: bind, then geometry once per batch of
  // primitives (prim) with the arrays that writable (WriteMask) lets the
  // shader change, then unbind. The gl forms do the same for the host's
  // OpenGL drawing. kNotImplemented: the host draws the shape unshaded.
  virtual VStatus bind(const VDagPath &shapePath);
  virtual VStatus unbind(const VDagPath &shapePath);
  virtual VStatus geometry(const VDagPath &shapePath, int prim, unsigned int writable,
                           int indexCount, const unsigned int *indexArray, int vertexCount,
                           const int *vertexIDs, const float *vertexArray);
  virtual VStatus geometry(const VDagPath &shapePath, int prim, unsigned int writable,
                           int indexCount, const unsigned int *indexArray, int vertexCount,
                           const int *vertexIDs, const float *vertexArray, int normalCount,
                           const float *normalArray, int colorCount, const float *colorArray,
                           int texCoordCount, const float *texCoordArray);
  virtual VStatus glBind(const VDagPath &shapePath);
  virtual VStatus glUnbind(const VDagPath &shapePath);
  virtual VStatus glGeometry(const VDagPath &shapePath, int prim, unsigned int writable,
                             int indexCount, const unsigned int *indexArray, int vertexCount,
                             const int *vertexIDs, const float *vertexArray);
  virtual VStatus glGeometry(const VDagPath &shapePath, int prim, unsigned int writable,
                             int indexCount, const unsigned int *indexArray, int vertexCount,
                             const int *vertexIDs, const float *vertexArray, int normalCount,
                             const float *normalArray, int colorCount, const float *colorArray,
                             int texCoordCount, const float *texCoordArray);

  // What geometry passes to the shader: whether it can batch shapes, flips
  // texture coordinates, and how many arrays of each kind it wants per
  // vertex (normals: 0 to 3, with tangents; colors and texture coordinates:
  // one per set that getColorSetNames and getTexCoordSetNames name).
  virtual bool supportsBatching() const;
  virtual bool invertTexCoords() const;
  virtual int normalsPerVertex();
  virtual int colorsPerVertex();
  virtual int texCoordsPerVertex();
  virtual int getColorSetNames(VStringArray &names);
  virtual int getTexCoordSetNames(VStringArray &names);
  virtual bool provideVertexIDs();
  virtual bool provideFaceIDs();
  // Transparency: hasTransparency, and how the host sorts and culls
  // (TransparencyOptions flags).
  virtual bool hasTransparency();
  virtual unsigned int transparencyOptions();

  // During a draw: which arrays changed since the last one (DirtyMask), the
  // shape drawn and its shading engine.
  unsigned int dirtyMask() const;
  VDagPath currentPath() const;
  VObject currentShadingEngine() const;
  // The plug-in node behind a hardware shader node object; null for other
  // objects.
  static VPxHwShaderNode *getHwShaderNodePtr(VObject &object);
  static const char *className();

  static VObject outColor;
  static VObject outColorR;
  static VObject outColorG;
  static VObject outColorB;
  static VObject outTransparency;
  static VObject outTransparencyR;
  static VObject outTransparencyG;
  static VObject outTransparencyB;
  static VObject outMatteOpacity;
  static VObject outMatteOpacityR;
  static VObject outMatteOpacityG;
  static VObject outMatteOpacityB;
  static VObject outGlowColor;
  static VObject outGlowColorR;
  static VObject outGlowColorG;
  static VObject outGlowColorB;
};

OPENVORLA_NAMESPACE_CLOSE
