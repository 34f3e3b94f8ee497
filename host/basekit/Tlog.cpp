// Tlog: the application log, on stderr and in memory.
#include <basekit/Tlog.h>

#include <cstdio>
#include <mutex>

namespace {

struct Log {
  std::mutex mutex;
  std::vector<std::string> entries;
};

Log &theLog() {
  static Log log;
  return log;
}

}  // namespace

void Tlog::write(const std::string &entry) {
  Log &log = theLog();
  std::lock_guard<std::mutex> guard(log.mutex);
  std::fprintf(stderr, "%s\n", entry.c_str());
  log.entries.push_back(entry);
}

std::vector<std::string> Tlog::entries() {
  Log &log = theLog();
  std::lock_guard<std::mutex> guard(log.mutex);
  return log.entries;
}

void Tlog::clear() {
  Log &log = theLog();
  std::lock_guard<std::mutex> guard(log.mutex);
  log.entries.clear();
}
