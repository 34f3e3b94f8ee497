// VStreamUtils: values written to a data type's output stream.
#include <openvorla/VStreamUtils.h>

#include <ostream>
#include <string>

#include "NumberText.h"

OPENVORLA_NAMESPACE_OPEN

namespace {

VStatus put(std::ostream &out, const std::string &text) {
  if (out.good()) out << text;
  return out.good() ? VStatus(VStatus::kSuccess)
                    : VStatus(VStatus::kFailure, "The stream cannot be written");
}

}  // namespace

VStatus VStreamUtils::writeCharBuffer(std::ostream &out, const VString &text) {
  return put(out, text.asUTF8());
}

VStatus VStreamUtils::writeDouble(std::ostream &out, double value) {
  return put(out, formatDouble(value));
}

VStatus VStreamUtils::writeInt(std::ostream &out, int value) {
  return put(out, std::to_string(value));
}

const char *VStreamUtils::className() { return "VStreamUtils"; }

OPENVORLA_NAMESPACE_CLOSE
