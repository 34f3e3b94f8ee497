// The records behind VObject handles, for the library's own use: every object
// has a kind and a name, and an attribute also carries what the attribute
// function sets declared about it, which the graph reads when it initializes a
// node type.
#pragma once

#include <openvorla/VFn.h>
#include <openvorla/VObject.h>

#include <atomic>
#include <functional>
#include <mutex>
#include <string>
#include <vector>

OPENVORLA_NAMESPACE_OPEN

// An attribute's declaration. A bare attribute object (made without a
// function set) reads as a writable double defaulting to 0, its brief name
// its name.
struct AttributeInfo {
  bool isString = false;  // a typed string attribute; otherwise numeric
  int numericType = 0;    // the VFnNumericData::Type of a numeric attribute
  int dataType = 0;       // the VFnData::Type of a typed attribute (0: numeric)
  std::string briefName;
  double defaultNumber = 0.0;
  std::string defaultText;
  bool keyable = false;
  bool storable = true;
  bool readable = true;
  bool writable = true;
  bool hidden = false;
  bool hasMin = false;
  bool hasMax = false;
  double min = 0.0;
  double max = 0.0;
};

struct VObject::Record {
  Record(VFn::Type t, const char *n) : type(t), name(n ? n : "") {}

  std::atomic<int> refs{1};
  const VFn::Type type;
  const std::string name;
  std::mutex mutex;  // guards attribute and the data
  AttributeInfo attribute;
  // A data object's kind (a VFnData::Type) and its numbers: an array's
  // elements (points and vectors three numbers each), a matrix's sixteen.
  int dataType = 0;
  std::vector<double> data;
};

// The one place that makes records and reads them.
class VObjectFactory {
 public:
  static VObject make(VFn::Type type, const char *name);
  static const char *name(const VObject &object);
  // The declaration of an attribute object; false, and info untouched, for a
  // null object or one that is not an attribute.
  static bool attributeInfo(const VObject &object, AttributeInfo *info);
  // Changes the declaration under the record's lock; false as above.
  static bool updateAttribute(const VObject &object,
                              const std::function<void(AttributeInfo &)> &change);
  // Data objects, as the data function sets make and read them.
  static VObject makeData(int dataType, std::vector<double> numbers);
  // False for an object that is no data object of that kind (any kind: 0).
  static bool readData(const VObject &object, int dataType, int *kind,
                       std::vector<double> *numbers);
  static bool writeData(const VObject &object, int dataType, std::vector<double> numbers);
};

OPENVORLA_NAMESPACE_CLOSE
