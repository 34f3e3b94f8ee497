// TstringId: string-resource identifiers, counted for the stand-in's tests.
#include <scriptrunner/TstringId.h>

#include <atomic>

namespace {
std::atomic<int> gConstructed{0};
std::atomic<int> gDestroyed{0};
}  // namespace

TstringId::TstringId(const char *table, const char *key) : fTable(table), fKey(key) {
  ++gConstructed;
}

TstringId::~TstringId() { ++gDestroyed; }

int TstringId::constructedCount() { return gConstructed.load(); }
int TstringId::destroyedCount() { return gDestroyed.load(); }
