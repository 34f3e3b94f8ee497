// Per-class construction and destruction counters of the stand-in.
#include <standin/Lifetime.h>

#include <map>
#include <mutex>
#include <string>

namespace {

struct Counts {
  long constructed = 0;
  long destroyed = 0;
};

struct Table {
  std::mutex mutex;
  std::map<std::string, Counts> counts;
};

// Reached from the constructors of static host objects, so it is built on first use.
Table &table() {
  static Table t;
  return t;
}

Counts countsOf(const char *cls) {
  Table &t = table();
  std::lock_guard<std::mutex> guard(t.mutex);
  auto it = t.counts.find(cls);
  return it == t.counts.end() ? Counts() : it->second;
}

}  // namespace

namespace standin {

void noteConstructed(const char *cls) {
  Table &t = table();
  std::lock_guard<std::mutex> guard(t.mutex);
  ++t.counts[cls].constructed;
}

void noteDestroyed(const char *cls) {
  Table &t = table();
  std::lock_guard<std::mutex> guard(t.mutex);
  ++t.counts[cls].destroyed;
}

long constructedCount(const char *cls) { return countsOf(cls).constructed; }

long destroyedCount(const char *cls) { return countsOf(cls).destroyed; }

long aliveCount(const char *cls) {
  Counts c = countsOf(cls);
  return c.constructed - c.destroyed;
}

void resetCounts() {
  Table &t = table();
  std::lock_guard<std::mutex> guard(t.mutex);
  t.counts.clear();
}

}  // namespace standin
