// The type table shared with sibling modules, lookup of descriptors by name,
// and the cast lists that say which types convert to which.
//
// Every extension of the package links its own copy of this runtime, so the
// statics below exist once per module. The modules find each other through
// one capsule stored in the interpreter's module registry: the first module
// to start installs its own module record there, and each later module links
// its record into the circular list that starts at it and adopts the
// descriptors that earlier modules already have, so a mangled name denotes
// one record process-wide. The installer's capsule destructor frees the
// class records when the last installation goes away; owning wrappers hold a
// reference on the capsule so that this cannot happen while a destructor
// named by a class record may still be needed.
//
// Nothing here locks: the table, the cast lists' move-to-front and the
// lazily made statics all rely on the interpreter lock.

#include <cstring>

#include "internal.h"
#include "swigrt.h"

namespace swigrt {
namespace {

constexpr char kRuntimeModule[] = "swig_runtime_data4";
constexpr char kCapsuleName[] = "swig_runtime_data4.type_pointer_capsule";

PyObject *type_cache = nullptr;
// Borrowed: the registry module's dictionary owns the capsule. Cleared by
// the capsule's destructor, so it is never left dangling.
PyObject *table_capsule = nullptr;
int interpreter_counter = 0;
// The capsule this module's owning wrappers hold, whichever module installed
// it, and how many hold it: while any does, it cannot have been destroyed.
PyObject *held_capsule = nullptr;
long capsule_holders = 0;
// This module's own record, used for lookups when no capsule could be
// found (the table then is simply not shared).
swig_module_info *own_record = nullptr;

// Saves the pending error, if any, for the lifetime of the guard and
// discards whatever error the guarded code leaves behind.
class ErrorGuard {
 public:
  ErrorGuard() { PyErr_Fetch(&type_, &value_, &traceback_); }
  ~ErrorGuard() {
    PyErr_Clear();
    PyErr_Restore(type_, value_, traceback_);
  }
  ErrorGuard(const ErrorGuard &) = delete;
  ErrorGuard &operator=(const ErrorGuard &) = delete;

 private:
  PyObject *type_, *value_, *traceback_;
};

swig_module_info *ImportSharedTable() {
  ErrorGuard guard;
  return static_cast<swig_module_info *>(PyCapsule_Import(kCapsuleName, 0));
}

void DestroyCapsule(PyObject *capsule) {
  ErrorGuard guard;
  if (capsule == table_capsule) table_capsule = nullptr;
  if (--interpreter_counter != 0) return;
  auto *module = static_cast<swig_module_info *>(PyCapsule_GetPointer(capsule, kCapsuleName));
  for (size_t i = 0; module && i < module->size; ++i) {
    swig_type_info *ty = module->types[i];
    if (!ty || !ty->owndata) continue;
    auto *data = static_cast<SwigPyClientData *>(ty->clientdata);
    ty->clientdata = nullptr;
    ty->owndata = 0;
    if (data) detail::DeleteClientData(data);
  }
  Py_CLEAR(detail::this_string);
  detail::ReleaseGlobals();
  Py_CLEAR(type_cache);
}

void InstallSharedTable(swig_module_info *module) {
  ErrorGuard guard;  // failure is silent: the table then stays unshared
  PyObject *registry_module = PyImport_AddModule(kRuntimeModule);  // borrowed
  if (!registry_module) return;
  PyObject *capsule = PyCapsule_New(module, kCapsuleName, DestroyCapsule);
  if (!capsule) return;
  if (PyModule_AddObjectRef(registry_module, "type_pointer_capsule", capsule) == 0) {
    ++interpreter_counter;
    table_capsule = capsule;
  } else {
    // Never installed, so its destructor must not count an uninstallation.
    PyCapsule_SetDestructor(capsule, nullptr);
  }
  Py_DECREF(capsule);
}

// Binary search of each module's sorted `types`, from `start` up to but not
// including `end` (all modules when they are the same).
swig_type_info *MangledLookup(swig_module_info *start, swig_module_info *end, const char *name) {
  swig_module_info *iter = start;
  do {
    size_t lo = 0, hi = iter->size;
    while (lo < hi) {
      size_t mid = lo + (hi - lo) / 2;
      swig_type_info *candidate = iter->types[mid];
      if (!candidate || !candidate->name) break;
      int cmp = std::strcmp(name, candidate->name);
      if (cmp == 0) return candidate;
      if (cmp < 0)
        hi = mid;
      else
        lo = mid + 1;
    }
    iter = iter->next;
  } while (iter != end);
  return nullptr;
}

bool SameIgnoringSpaces(const char *a, const char *a_end, const char *b, const char *b_end) {
  for (;;) {
    while (a != a_end && *a == ' ') ++a;
    while (b != b_end && *b == ' ') ++b;
    if (a == a_end || b == b_end) return a == a_end && b == b_end;
    if (*a++ != *b++) return false;
  }
}

// True when `want` equals one of the '|'-separated spellings in `names`.
bool MatchesReadable(const char *names, const char *want) {
  const char *want_end = want + std::strlen(want);
  for (const char *alt = names;;) {
    const char *alt_end = std::strchr(alt, '|');
    if (!alt_end) alt_end = alt + std::strlen(alt);
    if (SameIgnoringSpaces(alt, alt_end, want, want_end)) return true;
    if (*alt_end == '\0') return false;
    alt = alt_end + 1;
  }
}

swig_type_info *ReadableLookup(swig_module_info *start, const char *name) {
  if (swig_type_info *ty = MangledLookup(start, start, name)) return ty;
  swig_module_info *iter = start;
  do {
    for (size_t i = 0; i < iter->size; ++i) {
      swig_type_info *ty = iter->types[i];
      if (ty && ty->str && MatchesReadable(ty->str, name)) return ty;
    }
    iter = iter->next;
  } while (iter != start);
  return nullptr;
}

// Cast-list search that leaves the list's order alone.
bool ListsSource(const swig_type_info *target, const char *source_name) {
  for (const swig_cast_info *c = target->cast; c; c = c->next)
    if (std::strcmp(c->type->name, source_name) == 0) return true;
  return false;
}

void LinkCast(swig_type_info *target, swig_cast_info *cast) {
  cast->prev = nullptr;
  cast->next = target->cast;
  if (target->cast) target->cast->prev = cast;
  target->cast = cast;
}

}  // namespace

PyObject *ThisString() {
  if (!detail::this_string) detail::this_string = PyUnicode_InternFromString("this");
  return detail::this_string;
}

PyObject *TypeCache() {
  if (!type_cache) type_cache = PyDict_New();
  return type_cache;
}

void InitializeModule(swig_module_info *module) {
  bool first_run = false;
  if (!module->next) {
    module->next = module;
    first_run = true;
  }
  if (!own_record) own_record = module;

  swig_module_info *shared = ImportSharedTable();
  if (!shared) {
    InstallSharedTable(module);
  } else {
    swig_module_info *iter = shared;
    do {
      if (iter == module) return;  // already part of the table
      iter = iter->next;
    } while (iter != shared);
    module->next = shared->next;
    shared->next = module;
  }
  if (!first_run) return;

  // Adopt the descriptors that other modules already have, so that equal
  // mangled names mean one record, and merge our cast entries into them.
  swig_module_info *others = module->next;
  bool alone = others == module;
  for (size_t i = 0; i < module->size; ++i) {
    swig_type_info *mine = module->type_initial[i];
    swig_type_info *type = alone ? nullptr : MangledLookup(others, module, mine->name);
    if (type) {
      if (mine->clientdata) type->clientdata = mine->clientdata;
    } else {
      type = mine;
    }
    for (swig_cast_info *cast = module->cast_initial[i]; cast->type; ++cast) {
      swig_type_info *source = alone ? nullptr : MangledLookup(others, module, cast->type->name);
      if (source) {
        // A shared target that already lists the source keeps its entry.
        if (type != mine && ListsSource(type, source->name)) continue;
        cast->type = source;
      }
      LinkCast(type, cast);
    }
    module->types[i] = type;
  }
  module->types[module->size] = nullptr;
}

swig_cast_info *TypeCheck(const char *source_name, swig_type_info *target) {
  if (!target || !source_name) return nullptr;
  swig_cast_info *head = target->cast;
  for (swig_cast_info *c = head; c; c = c->next) {
    if (std::strcmp(c->type->name, source_name) != 0) continue;
    // Move to front: a type converted once is usually converted again.
    if (c != head) {
      c->prev->next = c->next;
      if (c->next) c->next->prev = c->prev;
      c->prev = nullptr;
      c->next = head;
      head->prev = c;
      target->cast = c;
    }
    return c;
  }
  return nullptr;
}

const char *PrettyName(const swig_type_info *ty) {
  if (!ty) return nullptr;
  if (!ty->str) return ty->name;
  const char *last = ty->str;
  for (const char *s = ty->str; *s; ++s)
    if (*s == '|') last = s + 1;
  return last;
}

swig_type_info *TypeQuery(const char *type_string) {
  ErrorGuard guard;  // a query never raises and never disturbs a pending error
  PyObject *cache = TypeCache();
  PyObject *key = cache ? PyUnicode_FromString(type_string) : nullptr;
  if (key) {
    if (PyObject *hit = PyDict_GetItemWithError(cache, key)) {
      Py_DECREF(key);
      return static_cast<swig_type_info *>(PyCapsule_GetPointer(hit, nullptr));
    }
  }
  swig_module_info *table = ImportSharedTable();
  if (!table) table = own_record;
  swig_type_info *ty = table ? ReadableLookup(table, type_string) : nullptr;
  if (ty && key) {
    if (PyObject *entry = PyCapsule_New(ty, nullptr, nullptr)) {
      PyDict_SetItem(cache, key, entry);
      Py_DECREF(entry);
    }
  }
  Py_XDECREF(key);
  return ty;
}

namespace detail {
PyObject *this_string = nullptr;

PyObject *TableCapsule() {
  // While wrappers hold it, the capsule they hold is alive; otherwise it is
  // looked up afresh in the registry, where a sibling may have put it.
  if (capsule_holders > 0) return held_capsule;
  if (table_capsule) return table_capsule;
  ErrorGuard guard;
  PyObject *found = nullptr;
  PyObject *name = PyUnicode_FromString(kRuntimeModule);
  PyObject *registry = name ? PyImport_GetModule(name) : nullptr;
  Py_XDECREF(name);
  if (registry) {
    PyObject *capsule = PyObject_GetAttrString(registry, "type_pointer_capsule");
    if (capsule && PyCapsule_IsValid(capsule, kCapsuleName)) found = capsule;
    Py_XDECREF(capsule);  // the registry keeps it
    Py_DECREF(registry);
  }
  return found;
}

void NoteCapsuleHeld(PyObject *capsule) {
  held_capsule = capsule;
  ++capsule_holders;
}

void NoteCapsuleReleased() { --capsule_holders; }
}  // namespace detail

}  // namespace swigrt
