// A Python object held together with the interpreter lock: the lock is taken
// before the object is referenced and released after the reference is dropped.
#pragma once

#include <scriptrunner/TpythonLock.h>

#include <basekit/Tstring.h>
#include <basekit/TstringArray.h>

typedef struct _object PyObject;

class T_EXPORT TpythonObjectWithLock {
public:
  TpythonObjectWithLock();
  // Holds its own reference to object, which may be null.
  explicit TpythonObjectWithLock(PyObject *object);
  ~TpythonObjectWithLock();
  TpythonObjectWithLock(const TpythonObjectWithLock &) = delete;
  TpythonObjectWithLock &operator=(const TpythonObjectWithLock &) = delete;

  // True only for a str (or a subclass): the string receives its text. For
  // anything else, None and bytes included, false and the string is unchanged.
  bool getValue(Tstring &value) const;
  // True for a list or tuple (or a subclass) whose items are all str: the
  // array receives them. For another object, false and the array is unchanged;
  // for an item that is not a str, false and the array holds the items before it.
  bool getValue(TstringArray &value) const;
  // Replaces the held object with a new str of that text. If Python cannot make
  // the str, the held object becomes null and the Python error stays set.
  void setValue(const Tstring &value);

  PyObject *object() const { return fObject; }  // borrowed; may be null

private:
  TpythonLock fLock;  // declared first: taken before fObject, released after it
  PyObject *fObject;
};
