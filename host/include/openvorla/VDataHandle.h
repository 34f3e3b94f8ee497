// Handle to one value of a data block. A value holds a number, a string, a
// compound of numbers (a point, a vector, a color), a matrix, or data (an
// array) reached through a data object; reading another kind gives 0, the
// empty string, the zero vector, the identity or the null object. Copies of
// a handle, and the block it came from, share the value.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VMatrix.h>
#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VVector.h>

#include <memory>

OPENVORLA_NAMESPACE_OPEN

struct VDataSlot;

class OPENVORLA_EXPORT VDataHandle {
public:
  VDataHandle();  // the null handle: reads give 0, writes are ignored
  VDataHandle(const VDataHandle &other);
  ~VDataHandle();
  VDataHandle &operator=(const VDataHandle &other);

  bool isNull() const;

  double asDouble() const;
  float asFloat() const;
  int asInt() const;  // truncated towards zero
  bool asBool() const;
  VString asString() const;
  // The first three numbers of a compound (a point read as a vector).
  VVector asVector() const;
  VMatrix asMatrix() const;
  // A new data object holding a copy of the value's data (an array or a
  // matrix), for the data function sets; the null object for other values.
  VObject data() const;

  void setDouble(double value);
  void setFloat(float value);
  void setInt(int value);
  void setBool(bool value);
  void setString(const VString &value);
  void set2Double(double x, double y);
  void set3Double(double x, double y, double z);
  void setMVector(const VVector &value);
  void setMMatrix(const VMatrix &value);
  // The data of a data object the data function sets made; kInvalidParameter
  // for an object that is none.
  VStatus setMObject(const VObject &data);
  // setDouble and setString by the value's kind.
  void set(double value);
  void set(const VString &value);

  // Marks the value as computed; setting a value does not.
  void setClean();
  bool isClean() const;

private:
  friend class VDataBlock;
  explicit VDataHandle(std::shared_ptr<VDataSlot> slot);
  std::shared_ptr<VDataSlot> fSlot;
};

OPENVORLA_NAMESPACE_CLOSE
