// The content tables' getters in the module's own form: the caller passes
// lists that are rewritten in place, and the principal string is the result.
//
// The host fills several strings through reference parameters, which Python
// cannot pass; the adapters here gather them into the lists instead. The lists
// are rewritten before the host's status is looked at, so a failing status
// still leaves them rewritten.
#include "OpenVorlaVPx_wrap.h"

namespace OpenVorlaVPx_wrap {
namespace {

// getEntry or getInfo with their outputs gathered: `first` gets the second
// and third string outputs, `second` the host's array; the first string
// output is the result.
template <class Get>
VString Gathered(Get get, VStringArray &first, VStringArray &second, VStatus &status) {
  first.clear();
  second.clear();
  VString key, unresolved, resolved, context;
  status = get(key, unresolved, resolved, context, second);
  if (status) {
    first.append(unresolved);
    first.append(resolved);
  }
  return key;
}

// The result, the lists written back in order, then the status.
PyObject *Finish(const VString &result, PyObject **lists, VStringArray **arrays,
                 const char *const (*messages)[2], int count, const VStatus &status) {
  PyObject *resultobj = swigrt::FromString(result);
  if (!resultobj) return nullptr;
  for (int i = 0; i < count; ++i) {
    if (!swigrt::UpdateOutputList(lists[i], *arrays[i], messages[i][0], messages[i][1])) {
      Py_DECREF(resultobj);
      return nullptr;
    }
  }
  if (!swigrt::StatusSucceeded(status)) {
    Py_DECREF(resultobj);
    return nullptr;
  }
  return resultobj;
}

const char *const kListMessages[][2] = {
    {"Argument 3 must be a list object", "Unable to modify argument 3 to return results"},
    {"Argument 4 must be a list object", "Unable to modify argument 4 to return results"},
    {"Argument 5 must be a list object", "Unable to modify argument 5 to return results"},
};

// The arguments after the second of an info-table getter, both forms:
// (self, what, list, list) and (self, what, list, context, list).
struct InfoLists {
  VStringArray first, second;
  VString context;
  PyObject *lists[2] = {};
  int last_argument = 4;

  InfoLists(PyObject **argv, Py_ssize_t count) {
    const bool with_context = count == 5;
    last_argument = with_context ? 5 : 4;
    lists[0] = argv[2];
    lists[1] = argv[last_argument - 1];
    swigrt::StringArrayArg(argv[2], first, "Expected a list of Strings or Unicode objects for argument 3");
    if (with_context)
      swigrt::StringArg(argv[3], context, "Expected a String or Unicode object for argument 4");
    swigrt::StringArrayArg(lists[1], second,
                           with_context ? "Expected a list of Strings or Unicode objects for argument 5"
                                        : "Expected a list of Strings or Unicode objects for argument 4");
  }

  PyObject *Finish(const VString &result, const VStatus &status) {
    VStringArray *arrays[] = {&first, &second};
    const char *const messages[][2] = {{kListMessages[0][0], kListMessages[0][1]},
                                       {kListMessages[last_argument - 3][0],
                                        kListMessages[last_argument - 3][1]}};
    return OpenVorlaVPx_wrap::Finish(result, lists, arrays, messages, 2, status);
  }
};

VExternalContentInfoTable *InfoTable(PyObject *obj, const char *message, const char *null_message) {
  void *argp1 = nullptr;
  if (!swigrt::ReferenceArg(obj, SWIGTYPE_p_VExternalContentInfoTable, &argp1, message, null_message))
    return nullptr;
  return static_cast<VExternalContentInfoTable *>(argp1);
}

PyObject *Dispatch(PyObject *args, const char *name, const char *message,
                   PyObject *(*four)(Py_ssize_t, PyObject **),
                   PyObject *(*five)(Py_ssize_t, PyObject **)) {
  PyObject *argv[5] = {};
  Py_ssize_t argc = swigrt::UnpackTuple(args, name, 0, 5, argv) - 1;
  PyObject *result = nullptr;
  if (argc == 4)
    result = four(argc, argv);
  else if (argc == 5)
    result = five(argc, argv);
  if (!swigrt::DispatchFailed(result)) return result;
  swigrt::RaiseOrModifyTypeError(message);
  return nullptr;
}

PyObject *EntryByIndex(Py_ssize_t argc, PyObject **argv, Py_ssize_t count) {
  if (argc != count) return nullptr;
  VExternalContentInfoTable *table = InfoTable(
      argv[0],
      "in method 'VExternalContentInfoTable_getEntryByIndex', argument 1 of type "
      "'VExternalContentInfoTable *'",
      "invalid null reference in method 'VExternalContentInfoTable_getEntryByIndex', argument 1 "
      "of type 'VExternalContentInfoTable *'");
  if (!table) return nullptr;
  unsigned int index{};
  if (!swigrt::ScalarArg(
          swigrt::AsUnsignedInt(argv[1], &index),
          "in method 'VExternalContentInfoTable_getEntryByIndex', argument 2 of type 'unsigned int'"))
    return nullptr;
  InfoLists out(argv, count);
  VStatus status;
  VString result = Gathered(
      [&](VString &key, VString &unresolved, VString &resolved, VString &node, VStringArray &roots) {
        return table->getEntry(index, key, unresolved, resolved, node, roots, out.context);
      },
      out.first, out.second, status);
  return out.Finish(result, status);
}

PyObject *InfoByKey(Py_ssize_t argc, PyObject **argv, Py_ssize_t count) {
  if (argc != count) return nullptr;
  VExternalContentInfoTable *table = InfoTable(
      argv[0],
      "in method 'VExternalContentInfoTable_getInfoByKey', argument 1 of type "
      "'VExternalContentInfoTable *'",
      "invalid null reference in method 'VExternalContentInfoTable_getInfoByKey', argument 1 of "
      "type 'VExternalContentInfoTable *'");
  if (!table) return nullptr;
  VString wanted;
  swigrt::StringArg(argv[1], wanted, "Expected a String or Unicode object for argument 2");
  InfoLists out(argv, count);
  VStatus status;
  VString result = Gathered(
      [&](VString &key, VString &unresolved, VString &resolved, VString &node, VStringArray &roots) {
        return table->getInfo(wanted, key, unresolved, resolved, node, roots, out.context);
      },
      out.first, out.second, status);
  return out.Finish(result, status);
}

}  // namespace

PyObject *wrap_VExternalContentInfoTable_getEntryByIndex(PyObject *, PyObject *args) {
  return Dispatch(
      args, "VExternalContentInfoTable_getEntryByIndex",
      "Wrong number or type of arguments for overloaded function "
      "'VExternalContentInfoTable_getEntryByIndex'.\n"
      "  Possible C/C++ prototypes are:\n"
      "    VExternalContentInfoTable::getEntryByIndex(unsigned int const,VStringArray &,"
      "VStringArray &,VStatus &)\n"
      "    VExternalContentInfoTable::getEntryByIndex(unsigned int const,VStringArray &,VString &,"
      "VStringArray &,VStatus &)\n",
      [](Py_ssize_t argc, PyObject **argv) { return EntryByIndex(argc, argv, 4); },
      [](Py_ssize_t argc, PyObject **argv) { return EntryByIndex(argc, argv, 5); });
}

PyObject *wrap_VExternalContentInfoTable_getInfoByKey(PyObject *, PyObject *args) {
  return Dispatch(
      args, "VExternalContentInfoTable_getInfoByKey",
      "Wrong number or type of arguments for overloaded function "
      "'VExternalContentInfoTable_getInfoByKey'.\n"
      "  Possible C/C++ prototypes are:\n"
      "    VExternalContentInfoTable::getInfoByKey(VString const &,VStringArray &,VStringArray &,"
      "VStatus &)\n"
      "    VExternalContentInfoTable::getInfoByKey(VString const &,VStringArray &,VString &,"
      "VStringArray &,VStatus &)\n",
      [](Py_ssize_t argc, PyObject **argv) { return InfoByKey(argc, argv, 4); },
      [](Py_ssize_t argc, PyObject **argv) { return InfoByKey(argc, argv, 5); });
}

PyObject *wrap_VExternalContentLocationTable_getLocationByKey(PyObject *, PyObject *args) {
  PyObject *argv[2] = {};
  if (!swigrt::UnpackTuple(args, "VExternalContentLocationTable_getLocationByKey", 2, 2, argv))
    return nullptr;
  void *argp1 = nullptr;
  if (!swigrt::ReferenceArg(
          argv[0], SWIGTYPE_p_VExternalContentLocationTable, &argp1,
          "in method 'VExternalContentLocationTable_getLocationByKey', argument 1 of type "
          "'VExternalContentLocationTable *'",
          "invalid null reference in method 'VExternalContentLocationTable_getLocationByKey', "
          "argument 1 of type 'VExternalContentLocationTable *'"))
    return nullptr;
  VString key, location;
  swigrt::StringArg(argv[1], key, "Expected a String or Unicode object for argument 2");
  VStatus status = static_cast<VExternalContentLocationTable *>(argp1)->getLocation(key, location);
  if (!swigrt::StatusSucceeded(status)) return nullptr;
  return swigrt::FromString(location);
}

PyObject *wrap_VExternalContentLocationTable_getEntryByIndex(PyObject *, PyObject *args) {
  PyObject *argv[3] = {};
  if (!swigrt::UnpackTuple(args, "VExternalContentLocationTable_getEntryByIndex", 3, 3, argv))
    return nullptr;
  void *argp1 = nullptr;
  if (!swigrt::ReferenceArg(
          argv[0], SWIGTYPE_p_VExternalContentLocationTable, &argp1,
          "in method 'VExternalContentLocationTable_getEntryByIndex', argument 1 of type "
          "'VExternalContentLocationTable *'",
          "invalid null reference in method 'VExternalContentLocationTable_getEntryByIndex', "
          "argument 1 of type 'VExternalContentLocationTable *'"))
    return nullptr;
  unsigned int index = 0;
  if (!swigrt::ScalarArg(swigrt::AsUnsignedInt(argv[1], &index),
                         "in method 'VExternalContentLocationTable_getEntryByIndex', argument 2 "
                         "of type 'unsigned int'"))
    return nullptr;
  VStringArray locations;
  swigrt::StringArrayArg(argv[2], locations,
                         "Expected a list of Strings or Unicode objects for argument 3");
  locations.clear();
  VString key, location;
  VStatus status = static_cast<VExternalContentLocationTable *>(argp1)->getEntry(index, key, location);
  if (status) locations.append(location);
  PyObject *lists[] = {argv[2]};
  VStringArray *arrays[] = {&locations};
  return Finish(key, lists, arrays, kListMessages, 1, status);
}

}  // namespace OpenVorlaVPx_wrap
