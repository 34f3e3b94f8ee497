// The per-thread stack of what the host is doing in plug-in code.
#include <standin/Operation.h>

namespace standin {

namespace {
thread_local Operation *tInnermost = nullptr;
}  // namespace

Operation::Operation(const void *object, const char *method)
    : fObject(object), fMethod(method), fOuter(tInnermost) {
  tInnermost = this;
}

Operation::~Operation() { tInnermost = fOuter; }

Operation *Operation::current() { return tInnermost; }

}  // namespace standin
