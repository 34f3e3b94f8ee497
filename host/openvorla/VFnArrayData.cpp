// The data function sets: arrays and matrices in data objects, as data block
// values hold them (numbers in a row; points and vectors three each).
#include <openvorla/VFnDoubleArrayData.h>
#include <openvorla/VFnIntArrayData.h>
#include <openvorla/VFnMatrixData.h>
#include <openvorla/VFnPointArrayData.h>
#include <openvorla/VFnVectorArrayData.h>

#include <utility>
#include <vector>

#include "ObjectRecords.h"

OPENVORLA_NAMESPACE_OPEN

namespace {

void report(VStatus *ReturnStatus, const VStatus &status) {
  if (ReturnStatus) *ReturnStatus = status;
}

VStatus notAttached() {
  return VStatus(VStatus::kInvalidParameter, "The function set is attached to no data of its kind");
}

// Elements to numbers and back, by the kind of element.
std::vector<double> flat(const VDoubleArray &a) {
  std::vector<double> out;
  for (unsigned int i = 0; i < a.length(); ++i) out.push_back(a[i]);
  return out;
}
std::vector<double> flat(const VIntArray &a) {
  std::vector<double> out;
  for (unsigned int i = 0; i < a.length(); ++i) out.push_back(a[i]);
  return out;
}
template <class Array>
std::vector<double> flat3(const Array &a) {
  std::vector<double> out;
  for (unsigned int i = 0; i < a.length(); ++i) out.insert(out.end(), {a[i].x, a[i].y, a[i].z});
  return out;
}
std::vector<double> flat(const VPointArray &a) { return flat3(a); }
std::vector<double> flat(const VVectorArray &a) { return flat3(a); }

void unflat(const std::vector<double> &n, VDoubleArray *a) {
  for (double v : n) a->append(v);
}
void unflat(const std::vector<double> &n, VIntArray *a) {
  for (double v : n) a->append(static_cast<int>(v));
}
void unflat(const std::vector<double> &n, VPointArray *a) {
  for (size_t i = 0; i + 2 < n.size(); i += 3) a->append(VPoint(n[i], n[i + 1], n[i + 2]));
}
void unflat(const std::vector<double> &n, VVectorArray *a) {
  for (size_t i = 0; i + 2 < n.size(); i += 3) a->append(VVector(n[i], n[i + 1], n[i + 2]));
}

template <class Array>
Array read(const VObject &object, int kind, VStatus *ReturnStatus) {
  std::vector<double> numbers;
  Array out;
  if (!VObjectFactory::readData(object, kind, nullptr, &numbers)) {
    report(ReturnStatus, notAttached());
    return out;
  }
  unflat(numbers, &out);
  report(ReturnStatus, VStatus::kSuccess);
  return out;
}

bool holds(const VObject &object, int kind) {
  return VObjectFactory::readData(object, kind, nullptr, nullptr);
}

}  // namespace

#define ARRAY_DATA(Class, Array, Kind)                                                          \
  Class::Class() = default;                                                                    \
  Class::Class(const VObject &object, VStatus *ReturnStatus) {                                 \
    bool ok = holds(object, VFnData::Kind);                                                    \
    if (ok) setObject(object);                                                                 \
    report(ReturnStatus, ok ? VStatus(VStatus::kSuccess) : notAttached());                    \
  }                                                                                            \
  Class::~Class() = default;                                                                   \
  VObject Class::create(const Array &elements, VStatus *ReturnStatus) {                        \
    VObject made = VObjectFactory::makeData(VFnData::Kind, flat(elements));                    \
    setObject(made);                                                                           \
    report(ReturnStatus, VStatus::kSuccess);                                                   \
    return made;                                                                               \
  }                                                                                            \
  Array Class::array(VStatus *ReturnStatus) const {                                            \
    return read<Array>(object(), VFnData::Kind, ReturnStatus);                                 \
  }                                                                                            \
  VStatus Class::set(const Array &elements) {                                                  \
    return VObjectFactory::writeData(object(), VFnData::Kind, flat(elements)) ? VStatus()      \
                                                                               : notAttached(); \
  }                                                                                            \
  unsigned int Class::length(VStatus *ReturnStatus) const {                                    \
    return array(ReturnStatus).length();                                                       \
  }                                                                                            \
  const char *Class::className() { return #Class; }

ARRAY_DATA(VFnPointArrayData, VPointArray, kPointArray)
ARRAY_DATA(VFnVectorArrayData, VVectorArray, kVectorArray)
ARRAY_DATA(VFnDoubleArrayData, VDoubleArray, kDoubleArray)
ARRAY_DATA(VFnIntArrayData, VIntArray, kIntArray)

#undef ARRAY_DATA

VFnMatrixData::VFnMatrixData() = default;

VFnMatrixData::VFnMatrixData(const VObject &object, VStatus *ReturnStatus) {
  bool ok = holds(object, VFnData::kMatrix);
  if (ok) setObject(object);
  report(ReturnStatus, ok ? VStatus(VStatus::kSuccess) : notAttached());
}

VFnMatrixData::~VFnMatrixData() = default;

namespace {

std::vector<double> flat(const VMatrix &m) {
  std::vector<double> out(16);
  for (int i = 0; i < 16; ++i) out[i] = m(i / 4, i % 4);
  return out;
}

}  // namespace

VObject VFnMatrixData::create(const VMatrix &matrix, VStatus *ReturnStatus) {
  VObject made = VObjectFactory::makeData(VFnData::kMatrix, flat(matrix));
  setObject(made);
  report(ReturnStatus, VStatus::kSuccess);
  return made;
}

VMatrix VFnMatrixData::matrix(VStatus *ReturnStatus) const {
  std::vector<double> n;
  if (!VObjectFactory::readData(object(), VFnData::kMatrix, nullptr, &n) || n.size() != 16) {
    report(ReturnStatus, notAttached());
    return VMatrix();
  }
  double rows[4][4];
  for (int i = 0; i < 16; ++i) rows[i / 4][i % 4] = n[i];
  report(ReturnStatus, VStatus::kSuccess);
  return VMatrix(rows);
}

VStatus VFnMatrixData::set(const VMatrix &matrix) {
  return VObjectFactory::writeData(object(), VFnData::kMatrix, flat(matrix)) ? VStatus()
                                                                              : notAttached();
}

const char *VFnMatrixData::className() { return "VFnMatrixData"; }

OPENVORLA_NAMESPACE_CLOSE
