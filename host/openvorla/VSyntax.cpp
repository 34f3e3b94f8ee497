// VSyntax: command syntax descriptions.
#include <openvorla/VSyntax.h>

#include <cstring>

OPENVORLA_NAMESPACE_OPEN

namespace {

bool isFlagName(const char *name) { return name && name[0] == '-' && name[1] != '\0'; }

bool isArgType(VSyntax::VArgType type) {
  return type > VSyntax::kInvalidArgType && type < VSyntax::kLastArgType;
}

}  // namespace

VSyntax::VSyntax()
    : fObjectType(kNone), fMinObjects(0), fMaxObjects(0xFFFFFFFFu), fQuery(false), fEdit(false) {}
VSyntax::VSyntax(const VSyntax &other) = default;
VSyntax::~VSyntax() = default;
VSyntax &VSyntax::operator=(const VSyntax &other) = default;

const VSyntax::Flag *VSyntax::find(const char *flagName) const {
  if (!flagName) return nullptr;
  for (const Flag &flag : fFlags)
    if (std::strcmp(flag.shortName.asUTF8(), flagName) == 0 ||
        std::strcmp(flag.longName.asUTF8(), flagName) == 0)
      return &flag;
  return nullptr;
}

VStatus VSyntax::addFlag(const char *shortName, const char *longName, VArgType argType1,
                         VArgType argType2, VArgType argType3) {
  if (!isFlagName(shortName) || !isFlagName(longName))
    return VStatus(VStatus::kInvalidParameter, "Flag names must start with '-'");
  if (find(shortName) || find(longName))
    return VStatus(VStatus::kInvalidParameter, "The flag is already defined");
  Flag flag{shortName, longName, {}, false};
  for (VArgType type : {argType1, argType2, argType3}) {
    if (type == kNoArg) break;
    if (!isArgType(type)) return VStatus(VStatus::kInvalidParameter, "Invalid flag argument type");
    flag.args.push_back(type);
  }
  fFlags.push_back(flag);
  return VStatus::kSuccess;
}

VStatus VSyntax::addArg(VArgType argType) {
  if (!isArgType(argType) || argType == kNoArg)
    return VStatus(VStatus::kInvalidParameter, "Invalid argument type");
  fArgs.push_back(argType);
  return VStatus::kSuccess;
}

VStatus VSyntax::makeFlagMultiUse(const char *flagName) {
  Flag *flag = const_cast<Flag *>(find(flagName));
  if (!flag) return VStatus(VStatus::kInvalidParameter, "No such flag");
  flag->multiUse = true;
  return VStatus::kSuccess;
}

VStatus VSyntax::setObjectType(ObjectType objectType, unsigned int minimumObjects) {
  if (objectType <= kInvalidObjectFormat || objectType >= kLastObjectFormat)
    return VStatus(VStatus::kInvalidParameter, "Invalid object type");
  fObjectType = objectType;
  fMinObjects = minimumObjects;
  return VStatus::kSuccess;
}

VSyntax::ObjectType VSyntax::objectType() const { return fObjectType; }

VStatus VSyntax::setMinObjects(unsigned int count) {
  if (count > fMaxObjects)
    return VStatus(VStatus::kInvalidParameter, "The minimum exceeds the maximum number of objects");
  fMinObjects = count;
  return VStatus::kSuccess;
}

VStatus VSyntax::setMaxObjects(unsigned int count) {
  if (count < fMinObjects)
    return VStatus(VStatus::kInvalidParameter,
                   "The maximum is below the minimum number of objects");
  fMaxObjects = count;
  return VStatus::kSuccess;
}

unsigned int VSyntax::minObjects() const { return fMinObjects; }
unsigned int VSyntax::maxObjects() const { return fMaxObjects; }
void VSyntax::enableQuery(bool supports) { fQuery = supports; }
void VSyntax::enableEdit(bool supports) { fEdit = supports; }
bool VSyntax::canQuery() const { return fQuery; }
bool VSyntax::canEdit() const { return fEdit; }

bool VSyntax::hasFlag(const char *flagName) const { return find(flagName) != nullptr; }

bool VSyntax::isFlagMultiUse(const char *flagName) const {
  const Flag *flag = find(flagName);
  return flag && flag->multiUse;
}

unsigned int VSyntax::numberOfFlagArgs(const char *flagName) const {
  const Flag *flag = find(flagName);
  return flag ? static_cast<unsigned int>(flag->args.size()) : 0;
}

VSyntax::VArgType VSyntax::flagArgType(const char *flagName, unsigned int index) const {
  const Flag *flag = find(flagName);
  return flag && index < flag->args.size() ? flag->args[index] : kInvalidArgType;
}

unsigned int VSyntax::numberOfFlags() const { return static_cast<unsigned int>(fFlags.size()); }
unsigned int VSyntax::numberOfArgs() const { return static_cast<unsigned int>(fArgs.size()); }

VSyntax::VArgType VSyntax::argType(unsigned int index) const {
  return index < fArgs.size() ? fArgs[index] : kInvalidArgType;
}

OPENVORLA_NAMESPACE_CLOSE
