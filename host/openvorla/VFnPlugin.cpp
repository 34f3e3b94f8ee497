// VFnPlugin: the table of loaded plug-ins and the registration function set.
#include <openvorla/VFnPlugin.h>

#include "PluginRegistry.h"

#include <standin/Lifetime.h>
#include <standin/Objects.h>
#include <standin/Plugins.h>
#include <standin/Registry.h>

#include <algorithm>
#include <atomic>
#include <memory>
#include <mutex>
#include <string>
#include <utility>
#include <vector>

OPENVORLA_NAMESPACE_OPEN

namespace {

struct MenuItem {
  VString name;
  VString label;
  VString parent;
  VString command;
  VString params;
  VString insertAfter;
};

struct PluginRecord {
  VObject object;
  VString name;
  VString vendor = "Unknown";
  VString version = "Unknown";
  VString apiVersion = "Any";
  VString loadPath;
  std::vector<MenuItem> menuItems;
  std::vector<VString> displayFilters;
  PyObject *uiProcs[4] = {nullptr, nullptr, nullptr, nullptr};
  VPluginCallableInfo *callableInfo = nullptr;
};

// Every member takes the one lock: plug-ins load and register from the host's
// main thread, so there is no contention worth finer locks.
struct PluginTable {
  std::mutex mutex;
  std::vector<std::unique_ptr<PluginRecord>> records;

  PluginRecord *find(const VObject &object) {
    if (object.isNull()) return nullptr;
    for (auto &r : records)
      if (r->object == object) return r.get();
    return nullptr;
  }

  PluginRecord *findByName(const VString &name) {
    for (auto &r : records)
      if (r->name == name) return r.get();
    return nullptr;
  }

  bool menuItemExists(const VString &name) {
    for (auto &r : records)
      for (const MenuItem &item : r->menuItems)
        if (item.name == name) return true;
    return false;
  }

  // name, or name with the smallest number from 1 that no plug-in has.
  template <typename Taken>
  static VString unique(const VString &name, Taken taken) {
    if (!taken(name)) return name;
    for (unsigned int n = 1;; ++n) {
      VString candidate = name + VString(std::to_string(n).c_str());
      if (!taken(candidate)) return candidate;
    }
  }

  PluginRecord &add(const VObject &object, const VString &name) {
    auto record = std::make_unique<PluginRecord>();
    record->object = object;
    record->name = unique(name, [this](const VString &n) { return findByName(n) != nullptr; });
    records.push_back(std::move(record));
    return *records.back();
  }
};

PluginTable &plugins() {
  static PluginTable table;
  return table;
}

std::atomic<bool> gRegisteringCallableScript{false};
std::atomic<long> gAnnouncements{0};

VStatus notAttached() {
  return VStatus(VStatus::kFailure, "The function set is not attached to a loaded plug-in");
}

void report(VStatus *ReturnStatus, const VStatus &status) {
  if (ReturnStatus) *ReturnStatus = status;
}

void recordIfGiven(VString &field, const char *value, const char *byDefault) {
  if (value && std::string(value) != byDefault) field = value;
}

}  // namespace

VFnPlugin::VFnPlugin() { standin::noteConstructed("VFnPlugin"); }

VFnPlugin::VFnPlugin(VObject &object, const char *vendor, const char *version,
                     const char *requiredApiVersion, VStatus *ReturnStatus)
    : VFnBase(object.apiType() == VFn::kPlugin ? object : VObject()) {
  standin::noteConstructed("VFnPlugin");
  if (object.apiType() != VFn::kPlugin) {
    report(ReturnStatus, VStatus(VStatus::kInvalidParameter, "The object is not a plug-in"));
    return;
  }
  PluginTable &table = plugins();
  std::lock_guard<std::mutex> guard(table.mutex);
  PluginRecord *record = table.find(object);
  if (!record) record = &table.add(object, standin::objectName(object));
  recordIfGiven(record->vendor, vendor, "Unknown");
  recordIfGiven(record->version, version, "Unknown");
  recordIfGiven(record->apiVersion, requiredApiVersion, "Any");
  report(ReturnStatus, VStatus::kSuccess);
}

VFnPlugin::~VFnPlugin() { standin::noteDestroyed("VFnPlugin"); }

namespace {

// A field of the attached plug-in's record, or "" when there is none.
VString readField(const VObject &plugin, VString PluginRecord::*field) {
  PluginTable &table = plugins();
  std::lock_guard<std::mutex> guard(table.mutex);
  PluginRecord *record = table.find(plugin);
  return record ? record->*field : VString();
}

}  // namespace

VString VFnPlugin::vendor() const { return readField(object(), &PluginRecord::vendor); }
VString VFnPlugin::version() const { return readField(object(), &PluginRecord::version); }
VString VFnPlugin::apiVersion() const { return readField(object(), &PluginRecord::apiVersion); }
VString VFnPlugin::name() const { return readField(object(), &PluginRecord::name); }
VString VFnPlugin::loadPath() const { return readField(object(), &PluginRecord::loadPath); }

VStatus VFnPlugin::setName(const VString &newName, bool allowRename) {
  if (newName.length() == 0)
    return VStatus(VStatus::kInvalidParameter, "A plug-in name cannot be empty");
  PluginTable &table = plugins();
  std::lock_guard<std::mutex> guard(table.mutex);
  PluginRecord *record = table.find(object());
  if (!record) return notAttached();
  PluginRecord *holder = table.findByName(newName);
  if (holder == record) return VStatus::kSuccess;
  if (holder && !allowRename)
    return VStatus(VStatus::kFailure,
                   VString("The plug-in name '") + newName + "' is already in use");
  record->name = PluginTable::unique(newName, [&table, record](const VString &n) {
    PluginRecord *other = table.findByName(n);
    return other && other != record;
  });
  return VStatus::kSuccess;
}

VStatus VFnPlugin::setVersion(const VString &newVersion) {
  PluginTable &table = plugins();
  std::lock_guard<std::mutex> guard(table.mutex);
  PluginRecord *record = table.find(object());
  if (!record) return notAttached();
  record->version = newVersion;
  return VStatus::kSuccess;
}

VObject VFnPlugin::findPlugin(const VString &pluginName) {
  PluginTable &table = plugins();
  std::lock_guard<std::mutex> guard(table.mutex);
  PluginRecord *record = table.findByName(pluginName);
  return record ? record->object : VObject();
}

bool VFnPlugin::isNodeRegistered(const VString &typeName) {
  return registry::isNodeRegistered(typeName);
}

VTypeId VFnPlugin::matrixTypeIdFromXformId(const VTypeId &xformTypeId) {
  return VTypeId(registry::matrixTypeId(object(), xformTypeId.id()));
}

VStringArray VFnPlugin::addMenuItem(const VString &menuItemName, const VString &parentName,
                                    const VString &commandName, const VString &commandParams,
                                    bool needOptionBox, const VString *optBoxFunction,
                                    VStatus *ReturnStatus, const VString *insertAfter) {
  return addMenuItem(menuItemName, menuItemName, parentName, commandName, commandParams,
                     needOptionBox, optBoxFunction, ReturnStatus, insertAfter);
}

VStringArray VFnPlugin::addMenuItem(const VString &menuItemName, const VString &menuItemLabel,
                                    const VString &parentName, const VString &commandName,
                                    const VString &commandParams, bool needOptionBox,
                                    const VString *optBoxFunction, VStatus *ReturnStatus,
                                    const VString *insertAfter) {
  VStringArray made;
  if (menuItemName.length() == 0 || parentName.length() == 0) {
    report(ReturnStatus,
           VStatus(VStatus::kInvalidParameter, "A menu item needs a name and a parent menu"));
    return made;
  }
  if (needOptionBox && (!optBoxFunction || optBoxFunction->length() == 0)) {
    report(ReturnStatus,
           VStatus(VStatus::kInvalidParameter, "An option box needs the command it runs"));
    return made;
  }
  PluginTable &table = plugins();
  std::lock_guard<std::mutex> guard(table.mutex);
  PluginRecord *record = table.find(object());
  if (!record) {
    report(ReturnStatus, notAttached());
    return made;
  }
  auto taken = [&table](const VString &n) { return table.menuItemExists(n); };
  VString after = insertAfter ? *insertAfter : VString();
  MenuItem item{PluginTable::unique(menuItemName, taken),
                menuItemLabel,
                parentName,
                commandName,
                commandParams,
                after};
  record->menuItems.push_back(item);
  made.append(item.name);
  if (needOptionBox) {
    MenuItem box{PluginTable::unique(item.name + "Option", taken),
                 menuItemLabel,
                 parentName,
                 *optBoxFunction,
                 VString(),
                 item.name};
    record->menuItems.push_back(box);
    made.append(box.name);
  }
  report(ReturnStatus, VStatus::kSuccess);
  return made;
}

VStatus VFnPlugin::removeMenuItem(VStringArray &menuItemNames) {
  PluginTable &table = plugins();
  std::lock_guard<std::mutex> guard(table.mutex);
  PluginRecord *record = table.find(object());
  if (!record) return notAttached();
  // On return the array holds the names that were not found.
  VStringArray notFound;
  for (unsigned int i = 0; i < menuItemNames.length(); ++i) {
    VString itemName = menuItemNames[i];
    auto &items = record->menuItems;
    auto it = std::find_if(items.begin(), items.end(),
                           [&itemName](const MenuItem &m) { return m.name == itemName; });
    if (it == items.end())
      notFound.append(itemName);
    else
      items.erase(it);
  }
  menuItemNames = notFound;
  if (notFound.length() != 0)
    return VStatus(VStatus::kInvalidParameter, "A menu item to remove is not one of the plug-in's");
  return VStatus::kSuccess;
}

VStatus VFnPlugin::registerUI(PyObject *creationProc, PyObject *deletionProc,
                              PyObject *creationBatchProc, PyObject *deletionBatchProc) {
  if (!creationProc || !deletionProc)
    return VStatus(VStatus::kInvalidParameter,
                   "An interface needs a creation and a deletion procedure");
  PluginTable &table = plugins();
  std::lock_guard<std::mutex> guard(table.mutex);
  PluginRecord *record = table.find(object());
  if (!record) return notAttached();
  if (record->uiProcs[0])
    return VStatus(VStatus::kFailure, "The plug-in has registered its interface already");
  PyObject *procs[4] = {creationProc, deletionProc, creationBatchProc, deletionBatchProc};
  std::copy(std::begin(procs), std::end(procs), record->uiProcs);
  return VStatus::kSuccess;
}

VStatus VFnPlugin::registerDisplayFilter(const VString &filterName, const VString &,
                                         const VString &) {
  if (filterName.length() == 0)
    return VStatus(VStatus::kInvalidParameter, "A display filter needs a name");
  PluginTable &table = plugins();
  std::lock_guard<std::mutex> guard(table.mutex);
  PluginRecord *record = table.find(object());
  if (!record) return notAttached();
  for (auto &r : table.records)
    if (std::find(r->displayFilters.begin(), r->displayFilters.end(), filterName) !=
        r->displayFilters.end())
      return VStatus(VStatus::kInvalidParameter, "A display filter of that name exists already");
  record->displayFilters.push_back(filterName);
  return VStatus::kSuccess;
}

VStatus VFnPlugin::deregisterDisplayFilter(const VString &filterName) {
  PluginTable &table = plugins();
  std::lock_guard<std::mutex> guard(table.mutex);
  PluginRecord *record = table.find(object());
  if (!record) return notAttached();
  auto &filters = record->displayFilters;
  auto it = std::find(filters.begin(), filters.end(), filterName);
  if (it == filters.end())
    return VStatus(VStatus::kFailure,
                   VString("The plug-in has no display filter named '") + filterName + "'");
  filters.erase(it);
  return VStatus::kSuccess;
}

void VFnPlugin::setRegisteringCallableScript() {
  ++gAnnouncements;
  gRegisteringCallableScript.store(true);
}
bool VFnPlugin::registeringCallableScript() { return gRegisteringCallableScript.exchange(false); }

void VFnPlugin::setCallableInfo(VPluginCallableInfo *info) {
  PluginTable &table = plugins();
  std::lock_guard<std::mutex> guard(table.mutex);
  if (PluginRecord *record = table.find(object())) record->callableInfo = info;
}

VPluginCallableInfo *VFnPlugin::getCallableInfo() {
  PluginTable &table = plugins();
  std::lock_guard<std::mutex> guard(table.mutex);
  PluginRecord *record = table.find(object());
  return record ? record->callableInfo : nullptr;
}

const char *VFnPlugin::className() { return "VFnPlugin"; }

VString pluginName(const VObject &plugin) { return readField(plugin, &PluginRecord::name); }

// The plug-in table's lock is held while the registry changes, so that a
// plug-in being unloaded gains no registration on the way. A refused
// registration dies with the parameter and a removed one with `released`,
// both after the locks are given up.
VStatus submitRegistration(const VObject &plugin, RegistrationPtr registration) {
  Released released;
  PluginTable &table = plugins();
  std::lock_guard<std::mutex> guard(table.mutex);
  if (!table.find(plugin)) return notAttached();
  registration->plugin = plugin;
  return registry::add(registration, released);
}

VStatus withdrawRegistration(const VObject &plugin,
                             const std::function<VStatus(Released &)> &remove) {
  Released released;
  PluginTable &table = plugins();
  std::lock_guard<std::mutex> guard(table.mutex);
  if (!table.find(plugin)) return notAttached();
  return remove(released);
}

const VString VFnPlugin::kDefaultDataLocation("default");

OPENVORLA_NAMESPACE_CLOSE

namespace standin {

using namespace OPENVORLA_NAMESPACE;

VObject loadPlugin(const char *name, const char *loadPath) {
  VObject object = makeObject(VFn::kPlugin, name);
  PluginTable &table = plugins();
  std::lock_guard<std::mutex> guard(table.mutex);
  table.add(object, name ? name : "").loadPath = loadPath ? loadPath : "";
  return object;
}

void unloadPlugin(const VObject &plugin) {
  Released released;  // released last, with no lock held
  PluginTable &table = plugins();
  std::lock_guard<std::mutex> guard(table.mutex);
  auto &records = table.records;
  records.erase(std::remove_if(records.begin(), records.end(),
                               [&plugin](const auto &r) { return r->object == plugin; }),
                records.end());
  registry::removeAll(plugin, released);
}

void unloadAllPlugins() {
  Released released;
  PluginTable &table = plugins();
  std::lock_guard<std::mutex> guard(table.mutex);
  table.records.clear();
  registry::clear(released);
}

long announcements() { return gAnnouncements.load(); }
void resetAnnouncements() { gAnnouncements.store(0); }

}  // namespace standin
