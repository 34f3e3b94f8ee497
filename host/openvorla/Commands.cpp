// The command engine: commands made through the registry and run with their
// arguments; the undoable ones kept for undo and redo.
//
// The stacks own their commands. A command is taken off its stack while its
// undoIt or redoIt runs, so that no lock is held across the call, and goes
// onto the other stack when it succeeds, back onto its own when it fails.
// Commands are deleted with no lock held: deleting a script's command takes
// the interpreter lock.
#include <openvorla/VArgList.h>
#include <openvorla/VDoubleArray.h>
#include <openvorla/VIntArray.h>
#include <openvorla/VPxCommand.h>
#include <openvorla/VStringArray.h>

#include <standin/Graph.h>
#include <standin/Registry.h>

#include <mutex>
#include <utility>

#include "CommandSyntax.h"
#include "HostCalls.h"
#include "NumberText.h"

OPENVORLA_NAMESPACE_OPEN

// The host's side of a command: the syntax it was registered with.
class VPxCommandAccess {
 public:
  static bool hasSyntax(const VPxCommand &command) { return command.hasSyntax(); }
  static void setSyntax(VPxCommand &command, const VSyntax &syntax) { command.fSyntax = syntax; }
};

OPENVORLA_NAMESPACE_CLOSE

namespace standin {

using namespace OPENVORLA_NAMESPACE;
using host::failed;
using host::failure;
using host::guardedVoid;
using host::quoted;

namespace {

struct Kept {
  std::string name;
  VPxCommand *command;
};

void deleteCommands(const std::vector<Kept> &commands) {
  for (const Kept &k : commands) guardedVoid([&] { standin::deleteCommand(k.command); });
}

}  // namespace

std::string CommandResult::text() const {
  std::string out;
  const size_t n = kind == kString ? texts.size() : numbers.size();
  for (size_t i = 0; i < n; ++i) {
    if (i) out += ' ';
    if (kind == kString)
      out += texts[i];
    else if (kind == kInt)
      out += std::to_string(static_cast<long long>(numbers[i]));
    else
      out += formatDouble(numbers[i]);
  }
  return out;
}

CommandResult currentCommandResult() {
  CommandResult r;
  r.isArray = VPxCommand::isCurrentResultArray();
  switch (VPxCommand::currentResultType()) {
    case VPxCommand::kLong:
      r.kind = CommandResult::kInt;
      if (r.isArray) {
        VIntArray values;
        VPxCommand::getCurrentResult(values);
        for (unsigned int i = 0; i < values.length(); ++i) r.numbers.push_back(values[i]);
      } else {
        r.numbers.push_back(VPxCommand::currentIntResult());
      }
      break;
    case VPxCommand::kDouble:
      r.kind = CommandResult::kDouble;
      if (r.isArray) {
        VDoubleArray values;
        VPxCommand::getCurrentResult(values);
        for (unsigned int i = 0; i < values.length(); ++i) r.numbers.push_back(values[i]);
      } else {
        r.numbers.push_back(VPxCommand::currentDoubleResult());
      }
      break;
    case VPxCommand::kString:
      r.kind = CommandResult::kString;
      if (r.isArray) {
        VStringArray values;
        VPxCommand::getCurrentResult(values);
        for (unsigned int i = 0; i < values.length(); ++i) r.texts.push_back(values[i].asUTF8());
      } else {
        r.texts.push_back(VPxCommand::currentStringResult().asUTF8());
      }
      break;
    case VPxCommand::kNoArg:
      r.isArray = false;
      break;
  }
  return r;
}

struct Commands::Impl {
  std::mutex mutex;
  std::vector<Kept> undo;
  std::vector<Kept> redo;
};

Commands::Commands() : impl_(new Impl) {}

// Never destroyed, as the graph: kept commands may be scripts'.
Commands &Commands::instance() {
  static Commands *commands = new Commands;
  return *commands;
}

namespace {

// The arguments as the command gets them: checked against its syntax when
// it has one.
VStatus argumentsFor(const std::string &name, VPxCommand &command, const std::vector<Value> &args,
                     VArgList *list) {
  VSyntax syntax;
  bool given = false;
  VStatus status = commandSyntax(VString(name.c_str()), &syntax, &given);
  if (!status) return status;
  bool check = false;
  if (given) {
    VPxCommandAccess::setSyntax(command, syntax);
    status = guardedVoid([&] { check = VPxCommandAccess::hasSyntax(command); });
    if (!status) return failed("The command " + quoted(name), status);
  }
  if (check) return parseCommandLine(name, syntax, args, list);
  plainCommandLine(args, list);
  return VStatus::kSuccess;
}

std::string commandLine(const std::string &name, const std::vector<Value> &args) {
  std::string line = name;
  for (const Value &v : args) line += v.isString ? " \"" + v.text + "\"" : " " + formatDouble(v.number);
  return line;
}

}  // namespace

VStatus Commands::run(const std::string &name, const std::vector<Value> &args,
                      CommandResult *result) {
  // Found again only when something is reported.
  auto running = [&name](const char *doing) {
    return [&name, doing] {
      return Operation::Description{
          host::pluginOf({"Command", "ConstraintCommand", "ContextCommand"}, name),
          doing + quoted(name)};
    };
  };
  VPxCommand *command = nullptr;
  VStatus status = host::inPluginVoid(nullptr, nullptr, running("creating the command "),
                                      [&] { command = standin::createCommand(name.c_str()); });
  if (!command) {
    if (!host::isRegistered({"Command", "ConstraintCommand", "ContextCommand"}, name))
      return failure(VStatus::kNotFound, "No command named " + quoted(name) + " is registered");
    return host::madeNone("The creator of the command " + quoted(name) + " made no command",
                          status);
  }
  VArgList list;
  status = argumentsFor(name, *command, args, &list);
  if (!status) {
    deleteCommands({{name, command}});
    return status;
  }
  command->setCommandString(commandLine(name, args).c_str());
  VPxCommand::clearResult();
  status = host::inPlugin(command, "doIt", running("running the command "),
                          [&] { return command->doIt(list); });
  bool undoable = false;
  if (status)
    status = host::inPluginVoid(command, "isUndoable", running("running the command "),
                                [&] { undoable = command->isUndoable(); });
  if (!status) {
    deleteCommands({{name, command}});
    return failed("The command " + quoted(name), status);
  }
  if (result) *result = currentCommandResult();
  std::vector<Kept> cut;
  if (undoable) {
    std::lock_guard<std::mutex> guard(impl_->mutex);
    cut.swap(impl_->redo);  // a new command ends the redo history
    impl_->undo.push_back({name, command});
  } else {
    cut.push_back({name, command});
  }
  deleteCommands(cut);
  return VStatus::kSuccess;
}

namespace {

// Takes the last command off `from`, runs it, and puts it on `to` when it
// succeeds, back on `from` when it fails.
template <typename Call>
VStatus step(std::mutex &mutex, std::vector<Kept> &from, std::vector<Kept> &to, const char *nothing,
             const char *doing, const char *method, Call call) {
  Kept kept;
  {
    std::lock_guard<std::mutex> guard(mutex);
    if (from.empty()) return failure(VStatus::kFailure, nothing);
    kept = from.back();
    from.pop_back();
  }
  VStatus status = host::inPlugin(
      kept.command, method,
      [&] {
        return Operation::Description{
            host::pluginOf({"Command", "ConstraintCommand", "ContextCommand"}, kept.name),
            host::lowered(doing) + " the command " + quoted(kept.name)};
      },
      [&] { return call(kept.command); });
  std::lock_guard<std::mutex> guard(mutex);
  if (!status) {
    from.push_back(kept);
    return failed(std::string(doing) + " the command " + quoted(kept.name), status);
  }
  to.push_back(kept);
  return VStatus::kSuccess;
}

}  // namespace

VStatus Commands::undo() {
  return step(impl_->mutex, impl_->undo, impl_->redo, "There is nothing to undo", "Undoing",
              "undoIt", [](VPxCommand *c) { return c->undoIt(); });
}

VStatus Commands::redo() {
  return step(impl_->mutex, impl_->redo, impl_->undo, "There is nothing to redo", "Redoing",
              "redoIt", [](VPxCommand *c) { return c->redoIt(); });
}

void Commands::flush() {
  std::vector<Kept> doomed;
  {
    std::lock_guard<std::mutex> guard(impl_->mutex);
    doomed.swap(impl_->undo);
    doomed.insert(doomed.end(), impl_->redo.begin(), impl_->redo.end());
    impl_->redo.clear();
  }
  deleteCommands(doomed);
}

}  // namespace standin
