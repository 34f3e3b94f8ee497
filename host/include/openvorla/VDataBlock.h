// The values of one node's attributes in one evaluation context, reached
// through data handles. A value is made, 0 and dirty, the first time it is asked
// for. Copies of a block share its values.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VDGContext.h>
#include <openvorla/VDataHandle.h>
#include <openvorla/VObject.h>
#include <openvorla/VPlug.h>
#include <openvorla/VStatus.h>

#include <cstddef>
#include <memory>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VDataBlock {
public:
  VDataBlock();  // no values, the normal context
  explicit VDataBlock(const VDGContext &context);
  VDataBlock(const VDataBlock &other);
  ~VDataBlock();
  VDataBlock &operator=(const VDataBlock &other);

  // The value of an attribute, or of a plug's attribute element. A null
  // attribute is kInvalidParameter and gives the null handle.
  VDataHandle inputValue(const VObject &attribute, VStatus *ReturnStatus = NULL);
  VDataHandle inputValue(const VPlug &plug, VStatus *ReturnStatus = NULL);
  VDataHandle outputValue(const VObject &attribute, VStatus *ReturnStatus = NULL);
  VDataHandle outputValue(const VPlug &plug, VStatus *ReturnStatus = NULL);

  VStatus setClean(const VObject &attribute);
  VStatus setClean(const VPlug &plug);
  // False for a value never asked for.
  bool isClean(const VObject &attribute, VStatus *ReturnStatus = NULL) const;
  bool isClean(const VPlug &plug, VStatus *ReturnStatus = NULL) const;

  VDGContext context() const;

private:
  struct State;
  std::shared_ptr<State> fState;
};

OPENVORLA_NAMESPACE_CLOSE
