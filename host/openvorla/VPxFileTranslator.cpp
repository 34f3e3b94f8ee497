// VPxFileTranslator: construction and destruction.
#include <openvorla/VPxFileTranslator.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxFileTranslator::VPxFileTranslator() { standin::noteConstructed("VPxFileTranslator"); }
VPxFileTranslator::~VPxFileTranslator() { standin::noteDestroyed("VPxFileTranslator"); }

OPENVORLA_NAMESPACE_CLOSE
