// The arguments a command is run with: booleans, integers, doubles and strings,
// in order. Each can be read as any kind it converts to: numbers as their text,
// integral doubles as integers, strings that spell a number or a boolean
// ("true", "on", "yes", "1" and their opposites) as such.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

#include <cstddef>
#include <vector>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VArgList {
public:
  // flagIndex() when the flag is absent.
  static constexpr unsigned int kInvalidArgIndex = 0xFFFFFFFFu;

  VArgList();
  VArgList(const VArgList &other);
  ~VArgList();
  VArgList &operator=(const VArgList &other);

  unsigned int length() const;

  // An index past the end, or an argument of a kind that does not convert, is
  // kInvalidParameter and gives false, 0 or the empty string.
  bool asBool(unsigned int index, VStatus *ReturnStatus = NULL) const;
  int asInt(unsigned int index, VStatus *ReturnStatus = NULL) const;
  double asDouble(unsigned int index, VStatus *ReturnStatus = NULL) const;
  VString asString(unsigned int index, VStatus *ReturnStatus = NULL) const;

  VArgList &addArg(bool value);
  VArgList &addArg(int value);
  VArgList &addArg(double value);
  VArgList &addArg(const VString &value);
  VArgList &addArg(const char *value);  // else a literal would be taken as a bool

  // The index of the first string argument equal to either flag name (a null
  // longFlag is not looked for), or kInvalidArgIndex.
  unsigned int flagIndex(const char *shortFlag, const char *longFlag = NULL) const;

private:
  struct Arg {
    enum Kind { kBool, kInt, kDouble, kString } kind;
    double number;
    VString text;
  };
  const Arg *at(unsigned int index, VStatus *ReturnStatus) const;
  std::vector<Arg> fArgs;
};

OPENVORLA_NAMESPACE_CLOSE
