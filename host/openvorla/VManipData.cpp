// VManipData: a number or a data object exchanged by manipulator conversions.
#include <openvorla/VManipData.h>

OPENVORLA_NAMESPACE_OPEN

VManipData::VManipData() : fSimple(true), fValue(0.0) {}
VManipData::VManipData(bool value) : fSimple(true), fValue(value ? 1.0 : 0.0) {}
VManipData::VManipData(int value) : fSimple(true), fValue(value) {}
VManipData::VManipData(unsigned int value) : fSimple(true), fValue(value) {}
VManipData::VManipData(double value) : fSimple(true), fValue(value) {}
VManipData::VManipData(const VObject &data) : fSimple(false), fValue(0.0), fData(data) {}
VManipData::VManipData(const VManipData &other) = default;
VManipData::~VManipData() = default;
VManipData &VManipData::operator=(const VManipData &other) = default;

bool VManipData::isSimple() const { return fSimple; }
bool VManipData::asBool() const { return fValue != 0.0; }
int VManipData::asLong() const { return static_cast<int>(fValue); }
unsigned int VManipData::asUnsigned() const {
  return fValue > 0.0 ? static_cast<unsigned int>(fValue) : 0u;
}
double VManipData::asDouble() const { return fValue; }
VObject VManipData::asVObject() const { return fData; }

OPENVORLA_NAMESPACE_CLOSE
