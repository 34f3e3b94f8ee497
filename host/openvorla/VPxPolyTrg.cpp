// VPxPolyTrg: the triangulator node type and the lookup of its functions.
#include <openvorla/VPxPolyTrg.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxPolyTrg::VPxPolyTrg() { standin::noteConstructed("VPxPolyTrg"); }
VPxPolyTrg::~VPxPolyTrg() { standin::noteDestroyed("VPxPolyTrg"); }

void VPxPolyTrg::postConstructor() {}
bool VPxPolyTrg::isAbstractClass() const { return true; }

// The stand-in registers no triangulation functions, so none is found.
VStatus VPxPolyTrg::triangulate(const char *name, const float *vert, const float *norm,
                                const int *loopSizes, int nbLoop, int nbTrg, unsigned short *trg) {
  if (!name || !vert || !norm || !loopSizes || !trg || nbLoop < 1 || nbTrg < 1)
    return VStatus::kInvalidParameter;
  return VStatus(VStatus::kNotFound,
                 VString("No triangulation function '") + name + "' is registered");
}

VStatus VPxPolyTrg::unregisterTrgFunction(const char *name) {
  if (!name) return VStatus::kInvalidParameter;
  return VStatus(VStatus::kNotFound,
                 VString("No triangulation function '") + name + "' is registered");
}

const char *VPxPolyTrg::className() { return "VPxPolyTrg"; }

OPENVORLA_NAMESPACE_CLOSE
