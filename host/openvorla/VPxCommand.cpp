// VPxCommand: the host's default command behaviour and the application's
// command result.
#include <openvorla/VPxCommand.h>

#include <basekit/Tlog.h>

#include <standin/Lifetime.h>

#include <mutex>
#include <string>
#include <vector>

OPENVORLA_NAMESPACE_OPEN

namespace {

// One result for the whole application, as its commands run one at a time.
// Integers and doubles keep their own vectors so that neither is converted.
struct Result {
  std::mutex mutex;
  VPxCommand::VResultType type = VPxCommand::kNoArg;
  bool isArray = false;
  std::vector<int> ints;
  std::vector<double> doubles;
  VStringArray strings;

  void reset(VPxCommand::VResultType newType, bool array) {
    type = newType;
    isArray = array;
    ints.clear();
    doubles.clear();
    strings.clear();
  }
};

Result &result() {
  static Result r;
  return r;
}

VStatus wrongKind() {
  return VStatus(VStatus::kInvalidParameter, "The current result is not of the kind asked for");
}

VStatus arrayResult() {
  return VStatus(VStatus::kInvalidParameter, "The current result is an array");
}

template <typename Array, typename T>
void setArray(VPxCommand::VResultType type, std::vector<T> &into, const Array &from) {
  Result &r = result();
  r.reset(type, true);
  for (unsigned int i = 0; i < from.length(); ++i) into.push_back(from[i]);
}

void report(VStatus *ReturnStatus, const VStatus &status) {
  if (ReturnStatus) *ReturnStatus = status;
}

// The result starts an array of the kind given unless it is one already.
void startAppend(Result &r, VPxCommand::VResultType type) {
  if (r.type != type) r.reset(type, true);
  r.isArray = true;
}

}  // namespace

VPxCommand::VPxCommand() : fUndoable(false), fHistoryOn(false) {
  standin::noteConstructed("VPxCommand");
}

VPxCommand::~VPxCommand() { standin::noteDestroyed("VPxCommand"); }

VStatus VPxCommand::doIt(const VArgList &) { return VStatus::kNotImplemented; }
VStatus VPxCommand::redoIt() { return VStatus::kNotImplemented; }
VStatus VPxCommand::undoIt() { return VStatus::kNotImplemented; }
bool VPxCommand::isUndoable() const { return fUndoable; }
bool VPxCommand::hasSyntax() const { return true; }

void VPxCommand::setResult(bool value) { setResult(value ? 1 : 0); }

void VPxCommand::setResult(int value) {
  Result &r = result();
  std::lock_guard<std::mutex> guard(r.mutex);
  r.reset(kLong, false);
  r.ints.push_back(value);
}

// Above the integer range the value is kept exactly as a double.
void VPxCommand::setResult(unsigned int value) {
  if (value <= 0x7FFFFFFFu)
    setResult(static_cast<int>(value));
  else
    setResult(static_cast<double>(value));
}

void VPxCommand::setResult(double value) {
  Result &r = result();
  std::lock_guard<std::mutex> guard(r.mutex);
  r.reset(kDouble, false);
  r.doubles.push_back(value);
}

void VPxCommand::setResult(const VString &value) {
  Result &r = result();
  std::lock_guard<std::mutex> guard(r.mutex);
  r.reset(kString, false);
  r.strings.append(value);
}

void VPxCommand::setResult(const VIntArray &value) {
  std::lock_guard<std::mutex> guard(result().mutex);
  setArray(kLong, result().ints, value);
}

void VPxCommand::setResult(const VDoubleArray &value) {
  std::lock_guard<std::mutex> guard(result().mutex);
  setArray(kDouble, result().doubles, value);
}

void VPxCommand::setResult(const VStringArray &value) {
  Result &r = result();
  std::lock_guard<std::mutex> guard(r.mutex);
  r.reset(kString, true);
  r.strings = value;
}

void VPxCommand::appendToResult(bool value) { appendToResult(value ? 1 : 0); }

void VPxCommand::appendToResult(int value) {
  Result &r = result();
  std::lock_guard<std::mutex> guard(r.mutex);
  startAppend(r, kLong);
  r.ints.push_back(value);
}

void VPxCommand::appendToResult(double value) {
  Result &r = result();
  std::lock_guard<std::mutex> guard(r.mutex);
  startAppend(r, kDouble);
  r.doubles.push_back(value);
}

void VPxCommand::appendToResult(const VString &value) {
  Result &r = result();
  std::lock_guard<std::mutex> guard(r.mutex);
  startAppend(r, kString);
  r.strings.append(value);
}

void VPxCommand::clearResult() {
  Result &r = result();
  std::lock_guard<std::mutex> guard(r.mutex);
  r.reset(kNoArg, false);
}

VPxCommand::VResultType VPxCommand::currentResultType() {
  Result &r = result();
  std::lock_guard<std::mutex> guard(r.mutex);
  return r.type;
}

bool VPxCommand::isCurrentResultArray() {
  Result &r = result();
  std::lock_guard<std::mutex> guard(r.mutex);
  return r.isArray;
}

int VPxCommand::currentIntResult(VStatus *ReturnStatus) {
  Result &r = result();
  std::lock_guard<std::mutex> guard(r.mutex);
  if (r.type != kLong) return report(ReturnStatus, wrongKind()), 0;
  if (r.isArray) return report(ReturnStatus, arrayResult()), 0;
  report(ReturnStatus, VStatus::kSuccess);
  return r.ints.front();
}

double VPxCommand::currentDoubleResult(VStatus *ReturnStatus) {
  Result &r = result();
  std::lock_guard<std::mutex> guard(r.mutex);
  if (r.type != kLong && r.type != kDouble) return report(ReturnStatus, wrongKind()), 0.0;
  if (r.isArray) return report(ReturnStatus, arrayResult()), 0.0;
  report(ReturnStatus, VStatus::kSuccess);
  return r.type == kLong ? r.ints.front() : r.doubles.front();
}

VString VPxCommand::currentStringResult(VStatus *ReturnStatus) {
  Result &r = result();
  std::lock_guard<std::mutex> guard(r.mutex);
  if (r.type != kString) return report(ReturnStatus, wrongKind()), VString();
  if (r.isArray) return report(ReturnStatus, arrayResult()), VString();
  report(ReturnStatus, VStatus::kSuccess);
  return r.strings[0];
}

VStatus VPxCommand::getCurrentResult(VIntArray &out) {
  out.clear();
  Result &r = result();
  std::lock_guard<std::mutex> guard(r.mutex);
  if (r.type != kLong) return wrongKind();
  for (int v : r.ints) out.append(v);
  return VStatus::kSuccess;
}

VStatus VPxCommand::getCurrentResult(VDoubleArray &out) {
  out.clear();
  Result &r = result();
  std::lock_guard<std::mutex> guard(r.mutex);
  if (r.type != kLong && r.type != kDouble) return wrongKind();
  for (int v : r.ints) out.append(v);
  for (double v : r.doubles) out.append(v);
  return VStatus::kSuccess;
}

VStatus VPxCommand::getCurrentResult(VStringArray &out) {
  out.clear();
  Result &r = result();
  std::lock_guard<std::mutex> guard(r.mutex);
  if (r.type != kString) return wrongKind();
  out = r.strings;
  return VStatus::kSuccess;
}

void VPxCommand::displayInfo(const VString &message) { Tlog::write(message.asUTF8()); }

void VPxCommand::displayWarning(const VString &message) {
  Tlog::write(std::string("Warning: ") + message.asUTF8());
}

void VPxCommand::displayError(const VString &message) {
  Tlog::write(std::string("Error: ") + message.asUTF8());
}

void VPxCommand::setUndoable(bool undoable) { fUndoable = undoable; }
VString VPxCommand::commandString() const { return fCommandString; }
void VPxCommand::setCommandString(const VString &command) { fCommandString = command; }
VSyntax VPxCommand::syntax() const { return fSyntax; }

VStatus VPxCommand::setHistoryOn(bool historyOn) {
  fHistoryOn = historyOn;
  return VStatus::kSuccess;
}

bool VPxCommand::isHistoryOn(VStatus *ReturnStatus) const {
  report(ReturnStatus, VStatus::kSuccess);
  return fHistoryOn;
}

const char *VPxCommand::className() { return "VPxCommand"; }

OPENVORLA_NAMESPACE_CLOSE
