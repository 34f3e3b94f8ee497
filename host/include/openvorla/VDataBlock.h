// The values of one node's attributes in one evaluation context, reached
// through data handles. A value is made, 0 and dirty, the first time it is asked
// for. Copies of a block share its values.
//
// The block that the graph passes to a node's compute holds the node's values:
// inputValue first brings the value up to date (a connected input is taken
// from its source, which is computed first when dirty), and an attribute that
// the node does not have is kInvalidParameter with the null handle.
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
  friend class VDataBlockAccess;
  struct State;
  VDataHandle value(const VPlug &plug, bool forRead, VStatus *ReturnStatus) const;
  std::shared_ptr<State> fState;
};

OPENVORLA_NAMESPACE_CLOSE
