// VArgList: command arguments and their conversions.
#include <openvorla/VArgList.h>

#include <cctype>
#include <cerrno>
#include <climits>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>

#include "NumberText.h"

OPENVORLA_NAMESPACE_OPEN

namespace {

VStatus failure(const char *message) { return VStatus(VStatus::kInvalidParameter, message); }

void report(VStatus *ReturnStatus, const VStatus &status) {
  if (ReturnStatus) *ReturnStatus = status;
}

bool parseInt(const char *text, int &value) {
  if (!*text || std::isspace(static_cast<unsigned char>(*text))) return false;
  char *end = nullptr;
  errno = 0;
  long parsed = std::strtol(text, &end, 10);
  if (*end || errno == ERANGE || parsed < INT_MIN || parsed > INT_MAX) return false;
  value = static_cast<int>(parsed);
  return true;
}

bool parseDouble(const char *text, double &value) {
  if (!*text || std::isspace(static_cast<unsigned char>(*text))) return false;
  char *end = nullptr;
  double parsed = std::strtod(text, &end);
  if (*end) return false;
  value = parsed;
  return true;
}

bool parseBool(const char *text, bool &value) {
  std::string word(text);
  for (char &c : word) c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
  for (const char *yes : {"true", "on", "yes", "1"})
    if (word == yes) {
      value = true;
      return true;
    }
  for (const char *no : {"false", "off", "no", "0"})
    if (word == no) {
      value = false;
      return true;
    }
  return false;
}

}  // namespace

VArgList::VArgList() = default;
VArgList::VArgList(const VArgList &other) = default;
VArgList::~VArgList() = default;
VArgList &VArgList::operator=(const VArgList &other) = default;

unsigned int VArgList::length() const { return static_cast<unsigned int>(fArgs.size()); }

const VArgList::Arg *VArgList::at(unsigned int index, VStatus *ReturnStatus) const {
  if (index >= fArgs.size()) {
    report(ReturnStatus, failure("Argument index out of range"));
    return nullptr;
  }
  report(ReturnStatus, VStatus::kSuccess);
  return &fArgs[index];
}

bool VArgList::asBool(unsigned int index, VStatus *ReturnStatus) const {
  const Arg *arg = at(index, ReturnStatus);
  if (!arg) return false;
  if (arg->kind != Arg::kString) return arg->number != 0.0;
  bool value = false;
  if (!parseBool(arg->text.asUTF8(), value))
    report(ReturnStatus, failure("Argument is not a boolean"));
  return value;
}

int VArgList::asInt(unsigned int index, VStatus *ReturnStatus) const {
  const Arg *arg = at(index, ReturnStatus);
  if (!arg) return 0;
  int value = 0;
  bool ok;
  if (arg->kind == Arg::kString) {
    ok = parseInt(arg->text.asUTF8(), value);
  } else {
    ok = std::trunc(arg->number) == arg->number && arg->number >= INT_MIN && arg->number <= INT_MAX;
    if (ok) value = static_cast<int>(arg->number);
  }
  if (!ok) report(ReturnStatus, failure("Argument is not an integer"));
  return value;
}

double VArgList::asDouble(unsigned int index, VStatus *ReturnStatus) const {
  const Arg *arg = at(index, ReturnStatus);
  if (!arg) return 0.0;
  if (arg->kind != Arg::kString) return arg->number;
  double value = 0.0;
  if (!parseDouble(arg->text.asUTF8(), value))
    report(ReturnStatus, failure("Argument is not a number"));
  return value;
}

VString VArgList::asString(unsigned int index, VStatus *ReturnStatus) const {
  const Arg *arg = at(index, ReturnStatus);
  if (!arg) return VString();
  switch (arg->kind) {
    case Arg::kString:
      return arg->text;
    case Arg::kBool:
      return arg->number != 0.0 ? "true" : "false";
    case Arg::kInt:
      return std::to_string(static_cast<int>(arg->number)).c_str();
    case Arg::kDouble:
      return formatDouble(arg->number).c_str();
  }
  return VString();
}

VArgList &VArgList::addArg(bool value) {
  fArgs.push_back({Arg::kBool, value ? 1.0 : 0.0, VString()});
  return *this;
}

VArgList &VArgList::addArg(int value) {
  fArgs.push_back({Arg::kInt, static_cast<double>(value), VString()});
  return *this;
}

VArgList &VArgList::addArg(double value) {
  fArgs.push_back({Arg::kDouble, value, VString()});
  return *this;
}

VArgList &VArgList::addArg(const VString &value) {
  fArgs.push_back({Arg::kString, 0.0, value});
  return *this;
}

VArgList &VArgList::addArg(const char *value) { return addArg(VString(value ? value : "")); }

unsigned int VArgList::flagIndex(const char *shortFlag, const char *longFlag) const {
  for (size_t i = 0; i < fArgs.size(); ++i) {
    if (fArgs[i].kind != Arg::kString) continue;
    const char *text = fArgs[i].text.asUTF8();
    if ((shortFlag && std::strcmp(text, shortFlag) == 0) ||
        (longFlag && std::strcmp(text, longFlag) == 0))
      return static_cast<unsigned int>(i);
  }
  return kInvalidArgIndex;
}

OPENVORLA_NAMESPACE_CLOSE
