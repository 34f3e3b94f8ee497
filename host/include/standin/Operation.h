// Stand-in only: what the application is doing on a thread when it calls into
// a plug-in's code, so that the scripting engine can say where a Python
// exception happened and the host can say why its operation failed.
//
// The host opens an Operation around each call into a plug-in object (a
// node's compute, a command's doIt, a creator); they nest per thread. The
// engine reads the innermost one when it reports an exception and leaves the
// exception's summary in it ("ValueError: bad input"), which the host puts
// into the text of its failure.
#pragma once

#include <openvorla/VApiVersion.h>

#include <string>
#include <utility>

namespace standin {

class OPENVORLA_EXPORT Operation {
 public:
  struct Description {
    std::string plugin;  // the plug-in whose code runs; empty when unknown
    std::string doing;   // "computing 'sine1.output'", "running the command 'offset'", ...
  };

  // `object`: the plug-in's object the host calls a method of, or null (a
  // creator, a plug-in's entry point); `method`: that method's name, or null.
  Operation(const void *object, const char *method);
  virtual ~Operation();
  Operation(const Operation &) = delete;
  Operation &operator=(const Operation &) = delete;

  // Only asked for when something is reported, so building the text costs
  // nothing on the way that succeeds.
  virtual Description describe() const = 0;

  const void *object() const { return fObject; }
  const char *method() const { return fMethod; }
  // The summary of the last Python exception reported during the operation.
  const std::string &failure() const { return fFailure; }
  void noteFailure(std::string summary) { fFailure = std::move(summary); }

  // The innermost operation of the calling thread, or null.
  static Operation *current();

 private:
  const void *fObject;
  const char *fMethod;
  std::string fFailure;
  Operation *fOuter;
};

// An Operation described by a function: doing(object, "compute", [&] { ... }).
template <class Describe>
class Doing final : public Operation {
 public:
  Doing(const void *object, const char *method, Describe describe)
      : Operation(object, method), fDescribe(std::move(describe)) {}
  Description describe() const override { return fDescribe(); }

 private:
  Describe fDescribe;
};

}  // namespace standin
