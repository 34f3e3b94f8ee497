// Handle to one value of a data block. A value holds a number or a string;
// reading the other kind gives 0 or the empty string. Copies of a handle, and
// the block it came from, share the value.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VString.h>

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

  void setDouble(double value);
  void setFloat(float value);
  void setInt(int value);
  void setBool(bool value);
  void setString(const VString &value);
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
