// Array of plugs.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPlug.h>
#include <openvorla/VStatus.h>

#include <vector>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPlugArray {
public:
  VPlugArray();
  VPlugArray(const VPlugArray &other);
  ~VPlugArray();
  VPlugArray &operator=(const VPlugArray &other);

  // index must be below length().
  VPlug operator[](unsigned int index) const;
  // kInvalidParameter when index is not below length().
  VStatus set(const VPlug &plug, unsigned int index);
  VStatus append(const VPlug &plug);
  VStatus remove(unsigned int index);
  VStatus clear();
  unsigned int length() const;

private:
  std::vector<VPlug> fPlugs;
};

OPENVORLA_NAMESPACE_CLOSE
