// The syntax of a command: its flags with the kinds of their arguments, the
// kinds of its positional arguments, and the objects it acts on.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

#include <vector>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VSyntax {
public:
  enum VArgType {
    kInvalidArgType,
    kNoArg,
    kBoolean,
    kLong,
    kDouble,
    kString,
    kUnsigned,
    kDistance,
    kAngle,
    kTime,
    kSelectionItem,
    kLastArgType
  };

  enum ObjectType {
    kInvalidObjectFormat,
    kNone,
    kStringObjects,
    kSelectionList,
    kLastObjectFormat
  };

  VSyntax();
  VSyntax(const VSyntax &other);
  ~VSyntax();
  VSyntax &operator=(const VSyntax &other);

  // Flag names start with '-' ("-v", "-verbose"). kInvalidParameter for a name
  // that does not, for a name already used and for an invalid argument kind;
  // kNoArg ends the argument list.
  VStatus addFlag(const char *shortName, const char *longName, VArgType argType1 = kNoArg,
                  VArgType argType2 = kNoArg, VArgType argType3 = kNoArg);
  VStatus addArg(VArgType argType);
  // kInvalidParameter for a flag that was not added.
  VStatus makeFlagMultiUse(const char *flagName);

  VStatus setObjectType(ObjectType objectType, unsigned int minimumObjects = 0);
  ObjectType objectType() const;
  VStatus setMinObjects(unsigned int count);
  VStatus setMaxObjects(unsigned int count);
  unsigned int minObjects() const;
  unsigned int maxObjects() const;  // 0xFFFFFFFF: no limit

  void enableQuery(bool supports = true);
  void enableEdit(bool supports = true);
  bool canQuery() const;
  bool canEdit() const;

  // Flags are found by their short or their long name.
  bool hasFlag(const char *flagName) const;
  bool isFlagMultiUse(const char *flagName) const;
  // The number of arguments the flag takes; 0 for an unknown flag.
  unsigned int numberOfFlagArgs(const char *flagName) const;
  // kInvalidArgType for an unknown flag or an index past its arguments.
  VArgType flagArgType(const char *flagName, unsigned int index) const;
  unsigned int numberOfFlags() const;
  unsigned int numberOfArgs() const;
  VArgType argType(unsigned int index) const;  // kInvalidArgType past the end

private:
  friend class VSyntaxParser;
  struct Flag {
    VString shortName;
    VString longName;
    std::vector<VArgType> args;
    bool multiUse;
  };
  const Flag *find(const char *flagName) const;
  std::vector<Flag> fFlags;
  std::vector<VArgType> fArgs;
  ObjectType fObjectType;
  unsigned int fMinObjects;
  unsigned int fMaxObjects;
  bool fQuery;
  bool fEdit;
};

OPENVORLA_NAMESPACE_CLOSE
