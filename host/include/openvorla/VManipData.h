// A value that a manipulator and a plug exchange through a manipulator
// container's conversions: a number (isSimple) or a data object.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VManipData {
public:
  VManipData();  // the number 0
  VManipData(bool value);
  VManipData(int value);
  VManipData(unsigned int value);
  VManipData(double value);
  VManipData(const VObject &data);
  VManipData(const VManipData &other);
  ~VManipData();
  VManipData &operator=(const VManipData &other);

  bool isSimple() const;
  // The number, converted; 0 for a data object.
  bool asBool() const;
  int asLong() const;
  unsigned int asUnsigned() const;
  double asDouble() const;
  // The data object; the null object for a number.
  VObject asVObject() const;

private:
  bool fSimple;
  double fValue;
  VObject fData;
};

OPENVORLA_NAMESPACE_CLOSE
