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

#include <climits>
#include <cmath>
#include <mutex>
#include <utility>

#include "HostCalls.h"
#include "NumberText.h"

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

bool isInt(double number) {
  return std::trunc(number) == number && number >= INT_MIN && number <= INT_MAX;
}

template <typename Array, typename Format>
std::string joined(const Array &array, Format format) {
  std::string text;
  for (unsigned int i = 0; i < array.length(); ++i) text += (i ? " " : "") + format(array[i]);
  return text;
}

}  // namespace

std::string commandResultText() {
  const bool array = VPxCommand::isCurrentResultArray();
  switch (VPxCommand::currentResultType()) {
    case VPxCommand::kLong:
      if (array) {
        VIntArray values;
        VPxCommand::getCurrentResult(values);
        return joined(values, [](int v) { return std::to_string(v); });
      }
      return std::to_string(VPxCommand::currentIntResult());
    case VPxCommand::kDouble:
      if (array) {
        VDoubleArray values;
        VPxCommand::getCurrentResult(values);
        return joined(values, [](double v) { return formatDouble(v); });
      }
      return formatDouble(VPxCommand::currentDoubleResult());
    case VPxCommand::kString:
      if (array) {
        VStringArray values;
        VPxCommand::getCurrentResult(values);
        return joined(values, [](const VString &v) { return std::string(v.asUTF8()); });
      }
      return VPxCommand::currentStringResult().asUTF8();
    case VPxCommand::kNoArg:
      break;
  }
  return "";
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

VStatus Commands::run(const std::string &name, const std::vector<Value> &args,
                      std::string *result) {
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
  std::string line = name;
  for (const Value &v : args) {
    if (v.isString) {
      list.addArg(VString(v.text.c_str()));
      line += " \"" + v.text + "\"";
    } else if (isInt(v.number)) {
      list.addArg(static_cast<int>(v.number));
      line += " " + std::to_string(static_cast<int>(v.number));
    } else {
      list.addArg(v.number);
      line += " " + formatDouble(v.number);
    }
  }
  command->setCommandString(line.c_str());
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
  if (result) *result = commandResultText();
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
