// VPxModelEditorCommand: construction and destruction.
#include <openvorla/VPxModelEditorCommand.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxModelEditorCommand::VPxModelEditorCommand() {
  standin::noteConstructed("VPxModelEditorCommand");
}
VPxModelEditorCommand::~VPxModelEditorCommand() { standin::noteDestroyed("VPxModelEditorCommand"); }

OPENVORLA_NAMESPACE_CLOSE
