// Command lines read against their syntax.
#include "CommandSyntax.h"

#include <cctype>
#include <climits>
#include <cmath>
#include <cstdlib>
#include <cstring>
#include <set>

#include "HostCalls.h"
#include "NumberText.h"

OPENVORLA_NAMESPACE_OPEN

using standin::host::failure;
using standin::host::quoted;
using standin::Value;

namespace {

bool isInt(double number) {
  return std::trunc(number) == number && number >= INT_MIN && number <= INT_MAX;
}

// The number a value is or spells, if it is one.
bool numberOf(const Value &v, double *number) {
  if (!v.isString) {
    *number = v.number;
    return true;
  }
  const char *text = v.text.c_str();
  char *end;
  *number = std::strtod(text, &end);
  return end != text && *end == '\0' && std::isfinite(*number) && !std::isspace(*text);
}

bool booleanOf(const Value &v, bool *out) {
  if (!v.isString) {
    *out = v.number != 0;
    return v.number == 0 || v.number == 1;
  }
  std::string word;
  for (char c : v.text) word += static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
  for (const char *yes : {"true", "on", "yes", "1"})
    if (word == yes) return *out = true;
  for (const char *no : {"false", "off", "no", "0"})
    if (word == no) return !(*out = false);
  return false;
}

const char *kindName(VSyntax::VArgType kind) {
  switch (kind) {
    case VSyntax::kBoolean: return "a boolean";
    case VSyntax::kLong: return "an integer";
    case VSyntax::kUnsigned: return "an integer of 0 or more";
    case VSyntax::kDouble: return "a number";
    case VSyntax::kDistance: return "a distance (a number)";
    case VSyntax::kAngle: return "an angle (a number)";
    case VSyntax::kTime: return "a time (a number)";
    case VSyntax::kSelectionItem: return "an object name";
    default: return "a string";
  }
}

// A value as a message shows it: text quoted, numbers as they read.
std::string shown(const Value &v) { return v.isString ? quoted(v.text) : formatDouble(v.number); }

// One argument as the command gets it.
struct Arg {
  enum Kind { kBool, kNumber, kString } kind;
  double number;
  std::string text;
};

void add(const Arg &arg, VArgList *list) {
  if (arg.kind == Arg::kString)
    list->addArg(VString(arg.text.c_str()));
  else if (arg.kind == Arg::kBool)
    list->addArg(arg.number != 0);
  else if (isInt(arg.number))
    list->addArg(static_cast<int>(arg.number));
  else
    list->addArg(arg.number);
}

// The value as the kind takes it; false if it does not take it.
bool convert(VSyntax::VArgType kind, const Value &v, Arg *out) {
  double number;
  switch (kind) {
    case VSyntax::kBoolean: {
      bool b;
      if (!booleanOf(v, &b)) return false;
      *out = {Arg::kBool, b ? 1.0 : 0.0, {}};
      return true;
    }
    case VSyntax::kLong:
    case VSyntax::kUnsigned:
      if (!numberOf(v, &number) || std::trunc(number) != number || number > UINT_MAX ||
          number < (kind == VSyntax::kLong ? INT_MIN : 0) ||
          (kind == VSyntax::kLong && number > INT_MAX))
        return false;
      *out = {Arg::kNumber, number, {}};
      return true;
    case VSyntax::kDouble:
    case VSyntax::kDistance:
    case VSyntax::kAngle:
    case VSyntax::kTime:
      if (!numberOf(v, &number)) return false;
      *out = {Arg::kNumber, number, {}};
      return true;
    case VSyntax::kSelectionItem:
      if (!v.isString) return false;
      *out = {Arg::kString, 0, v.text};
      return true;
    default:  // a string: a number stands for its text
      *out = {Arg::kString, 0, v.isString ? v.text : formatDouble(v.number)};
      return true;
  }
}

std::string counted(size_t n, const char *what) {
  return std::to_string(n) + " " + what + (n == 1 ? "" : "s");
}

// A string that looks like a flag: a dash, then a letter.
bool looksLikeFlag(const Value &v) {
  return v.isString && v.text.size() > 1 && v.text[0] == '-' &&
         std::isalpha(static_cast<unsigned char>(v.text[1]));
}

}  // namespace

// Reads VSyntax's flags directly: a flag's two names are one flag.
class VSyntaxParser {
 public:
  VSyntaxParser(const std::string &command, const VSyntax &syntax)
      : fCommand(quoted(command)), fSyntax(syntax) {}

  // Each value converted in its place, then all added in order.
  VStatus parse(const std::vector<Value> &args, VArgList *list) {
    fArgs.assign(args.size(), Arg{});
    VStatus status = read(args);
    if (status)
      for (const Arg &arg : fArgs) add(arg, list);
    return status;
  }

 private:
  VStatus read(const std::vector<Value> &args) {
    std::vector<size_t> rest;
    std::set<const void *> given;
    for (size_t i = 0; i < args.size(); ++i) {
      const Value &v = args[i];
      if (!looksLikeFlag(v)) {
        rest.push_back(i);
        continue;
      }
      const VSyntax::Flag *flag = fSyntax.find(v.text.c_str());
      std::vector<VSyntax::VArgType> kinds;
      const void *identity = flag;
      if (flag) {
        kinds = flag->args;
      } else if (!(identity = modeFlag(v.text))) {
        return failure(VStatus::kInvalidParameter,
                       "The command " + fCommand + " has no flag " + quoted(v.text));
      }
      const std::string name = "The flag " + quoted(v.text) + " of the command " + fCommand;
      if (!given.insert(identity).second && !(flag && flag->multiUse))
        return failure(VStatus::kInvalidParameter, name + " may be given only once");
      if (args.size() - i - 1 < kinds.size())
        return failure(VStatus::kInvalidParameter,
                       name + " takes " + counted(kinds.size(), "argument") + ", not " +
                           std::to_string(args.size() - i - 1));
      fArgs[i] = {Arg::kString, 0, v.text};
      for (size_t k = 0; k < kinds.size(); ++k) {
        const Value &arg = args[++i];
        if (!convert(kinds[k], arg, &fArgs[i]))
          return failure(VStatus::kInvalidParameter,
                         (kinds.size() > 1 ? "Argument " + std::to_string(k + 1) + " of t" +
                                                 name.substr(1)
                                           : name) +
                             " takes " + kindName(kinds[k]) + ", not " + shown(arg));
      }
    }
    return positional(args, rest);
  }

  // The query and edit flags of a syntax that enables them.
  const void *modeFlag(const std::string &text) const {
    if (fSyntax.canQuery() && (text == "-q" || text == "-query")) return &kQuery;
    if (fSyntax.canEdit() && (text == "-e" || text == "-edit")) return &kEdit;
    return nullptr;
  }

  VStatus positional(const std::vector<Value> &args, const std::vector<size_t> &rest) {
    const size_t wanted = fSyntax.fArgs.size();
    const bool objects = fSyntax.fObjectType == VSyntax::kStringObjects ||
                         fSyntax.fObjectType == VSyntax::kSelectionList;
    if (rest.size() < wanted || (!objects && rest.size() > wanted))
      return failure(VStatus::kInvalidParameter,
                     "The command " + fCommand + " takes " + counted(wanted, "argument") +
                         " besides its flags, not " + std::to_string(rest.size()));
    for (size_t k = 0; k < wanted; ++k)
      if (!convert(fSyntax.fArgs[k], args[rest[k]], &fArgs[rest[k]]))
        return failure(VStatus::kInvalidParameter,
                       "Argument " + std::to_string(k + 1) + " of the command " + fCommand +
                           " takes " + kindName(fSyntax.fArgs[k]) + ", not " +
                           shown(args[rest[k]]));
    if (!objects) return VStatus::kSuccess;
    const size_t count = rest.size() - wanted;
    if (count < fSyntax.fMinObjects)
      return failure(VStatus::kInvalidParameter,
                     "The command " + fCommand + " takes at least " +
                         counted(fSyntax.fMinObjects, "object") + ", not " + std::to_string(count));
    if (count > fSyntax.fMaxObjects)
      return failure(VStatus::kInvalidParameter,
                     "The command " + fCommand + " takes at most " +
                         counted(fSyntax.fMaxObjects, "object") + ", not " + std::to_string(count));
    for (size_t k = wanted; k < rest.size(); ++k)
      if (!convert(VSyntax::kSelectionItem, args[rest[k]], &fArgs[rest[k]]))
        return failure(VStatus::kInvalidParameter, "The command " + fCommand +
                                                       " takes objects by name, not " +
                                                       shown(args[rest[k]]));
    return VStatus::kSuccess;
  }

  static const char kQuery, kEdit;
  const std::string fCommand;
  const VSyntax &fSyntax;
  std::vector<Arg> fArgs;
};

const char VSyntaxParser::kQuery = 'q';
const char VSyntaxParser::kEdit = 'e';

VStatus parseCommandLine(const std::string &command, const VSyntax &syntax,
                         const std::vector<Value> &args, VArgList *list) {
  return VSyntaxParser(command, syntax).parse(args, list);
}

void plainCommandLine(const std::vector<Value> &args, VArgList *list) {
  for (const Value &v : args)
    add(v.isString ? Arg{Arg::kString, 0, v.text} : Arg{Arg::kNumber, v.number, {}}, list);
}

OPENVORLA_NAMESPACE_CLOSE
