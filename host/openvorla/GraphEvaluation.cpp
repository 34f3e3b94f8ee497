// Evaluation of the whole graph: every dirty computed value, node by node in
// topological levels, the nodes of one level spread over a pool of threads.
//
// The nodes to compute are those with a dirty computed attribute. A node
// waits for the nodes upstream of it that are computed too, also through
// nodes in between that compute nothing; a node's level is one past the
// highest of those. The threads take a level's nodes in turn and meet at a
// barrier before the next level, so every source a node reads is
// computed (or has failed) before the node starts. A node downstream of a
// failed one is not computed: it stays dirty, as the failed value does.
//
// As many threads as asked for work, or as the widest level has nodes if
// fewer, from a pool that lives from one evaluation to the next. The caller
// waits for them, so it must not hold the interpreter lock, which their
// computes of script nodes take.
#include <standin/Graph.h>

#include <algorithm>
#include <atomic>
#include <functional>
#include <memory>
#include <condition_variable>
#include <map>
#include <set>
#include <thread>
#include <unordered_map>
#include <unordered_set>

#include <standin/ScriptCallables.h>

#include "GraphModel.h"

namespace standin {

using namespace OPENVORLA_NAMESPACE;

namespace {

struct Item {
  graph::NodePtr node;
  std::vector<int> dirty;     // its computed attributes to bring up to date
  std::vector<int> upstream;  // the items it waits for
  int level = -1;
  VStatus failure;  // its first failure
  bool failed = false;
  bool blocked = false;  // by a failure upstream: left dirty, and blocks what is downstream
};

class Barrier {
 public:
  explicit Barrier(int count) : fCount(count) {}
  void wait() {
    std::unique_lock<std::mutex> lock(fMutex);
    int generation = fGeneration;
    if (++fArrived == fCount) {
      fArrived = 0;
      ++fGeneration;
      fAll.notify_all();
      return;
    }
    fAll.wait(lock, [&] { return generation != fGeneration; });
  }

 private:
  std::mutex fMutex;
  std::condition_variable fAll;
  const int fCount;
  int fArrived = 0;
  int fGeneration = 0;
};

// The threads that computed, in the order of their first compute.
class Run : public graph::EvaluationRun {
 public:
  void noteCompute() override {
    std::lock_guard<std::mutex> guard(fMutex);
    std::thread::id self = std::this_thread::get_id();
    if (std::find(fThreads.begin(), fThreads.end(), self) == fThreads.end())
      fThreads.push_back(self);
  }
  int threads() {
    std::lock_guard<std::mutex> guard(fMutex);
    return static_cast<int>(fThreads.size());
  }

 private:
  std::mutex fMutex;
  std::vector<std::thread::id> fThreads;
};

// Under the graph's mutex.
std::vector<Item> dirtyItems(const graph::GraphState &g) {
  std::vector<Item> items;
  std::unordered_map<const graph::Node *, int> index;
  for (const auto &entry : g.nodes) {
    const graph::NodePtr &n = entry.second;
    Item item;
    for (size_t a = 0; a < n->slots.size(); ++a)
      if (n->type->attributes[a].computed && !n->slots[a]->isClean())
        item.dirty.push_back(static_cast<int>(a));
    if (item.dirty.empty()) continue;
    item.node = n;
    index[n.get()] = static_cast<int>(items.size());
    items.push_back(std::move(item));
  }
  // Each item's nearest computed nodes upstream, through nodes that compute nothing.
  for (Item &item : items) {
    std::vector<const graph::Node *> work{item.node.get()};
    std::unordered_set<const graph::Node *> seen{item.node.get()};
    while (!work.empty()) {
      const graph::Node *n = work.back();
      work.pop_back();
      for (const graph::Connection &c : n->in) {
        if (!seen.insert(c.source).second) continue;
        auto found = index.find(c.source);
        if (found != index.end())
          item.upstream.push_back(found->second);
        else
          work.push_back(c.source);
      }
    }
  }
  return items;
}

// One past the highest level upstream, without recursion: chains can be long.
void assignLevels(std::vector<Item> &items) {
  for (size_t root = 0; root < items.size(); ++root) {
    if (items[root].level >= 0) continue;
    std::vector<int> stack{static_cast<int>(root)};
    while (!stack.empty()) {
      Item &item = items[stack.back()];
      bool ready = true;
      for (int u : item.upstream)
        if (items[u].level < 0) {
          stack.push_back(u);
          ready = false;
        }
      if (!ready) continue;
      int level = 0;
      for (int u : item.upstream) level = std::max(level, items[u].level + 1);
      item.level = level;
      stack.pop_back();
    }
  }
}

// Host threads kept for evaluation, made as more are first needed and never
// ended, so that each keeps what it set up (its interpreter thread state among
// them) from one evaluation to the next. run() has `count` of them call
// job(t), t from 0, and returns when all have.
class Pool {
 public:
  static Pool &instance() {
    static Pool *pool = new Pool;  // never destroyed: its threads never end
    return *pool;
  }

  void run(int count, const std::function<void(int)> &job) {
    std::unique_lock<std::mutex> lock(fMutex);
    while (static_cast<int>(fThreads.size()) < count) {
      int t = static_cast<int>(fThreads.size());
      fThreads.emplace_back([this, t] { work(t); });
      fThreads.back().detach();
    }
    fJob = &job;
    fCount = count;
    fPending = count;
    ++fRound;
    fStart.notify_all();
    fDone.wait(lock, [&] { return fPending == 0; });
    fJob = nullptr;
  }

 private:
  void work(int t) {
    unsigned long seen = 0;
    std::unique_lock<std::mutex> lock(fMutex);
    for (;;) {
      fStart.wait(lock, [&] { return fRound != seen; });
      seen = fRound;
      if (t >= fCount) continue;
      const std::function<void(int)> *job = fJob;
      lock.unlock();
      (*job)(t);
      lock.lock();
      if (--fPending == 0) fDone.notify_all();
    }
  }

  std::mutex fMutex;
  std::condition_variable fStart, fDone;
  std::vector<std::thread> fThreads;
  const std::function<void(int)> *fJob = nullptr;
  int fCount = 0;
  int fPending = 0;
  unsigned long fRound = 0;
};

void computeItem(graph::GraphState &g, std::vector<Item> &items, Item &item, Run &run) {
  for (int u : item.upstream)
    if (items[u].failed || items[u].blocked) {
      item.blocked = true;
      return;
    }
  graph::EvaluationThread outer = graph::tEvaluation;
  graph::tEvaluation = {&run, item.node.get()};
  for (int a : item.dirty) {
    VStatus status = g.refresh(item.node, a);
    if (!status && !item.failed) {
      item.failed = true;
      item.failure = status;
    }
  }
  graph::tEvaluation = outer;
}

}  // namespace

VStatus Graph::evaluate(int threads) {
  if (threads < 1)
    return graph::failure(VStatus::kInvalidParameter, "Evaluation needs one thread at least");
  std::vector<Item> items;
  {
    std::lock_guard<std::mutex> guard(impl_->mutex);
    items = dirtyItems(*impl_);
  }
  assignLevels(items);
  std::vector<std::vector<int>> levels;
  for (int i = 0; i < static_cast<int>(items.size()); ++i) {
    size_t level = static_cast<size_t>(items[i].level);
    if (levels.size() <= level) levels.resize(level + 1);
    levels[level].push_back(i);
  }
  size_t widest = 0;
  for (const auto &level : levels) widest = std::max(widest, level.size());

  Run run;
  // The threads take a level's nodes one by one from a shared counter. A
  // thread computing script nodes keeps the interpreter lock from one to the
  // next rather than taking it anew for each: compute that lets it go
  // (waiting, hashing, large array work) lets the others take the next nodes
  // meanwhile.
  auto computeLevel = [&](const std::vector<int> &level, std::atomic<size_t> &next) {
    std::unique_ptr<standin::ScriptsHeld> held;
    for (size_t i; (i = next++) < level.size();) {
      Item &item = items[level[i]];
      if (!item.node->type->scripted)
        held.reset();
      else if (!held)
        held = std::make_unique<standin::ScriptsHeld>();
      computeItem(*impl_, items, item, run);
    }
  };
  std::vector<std::atomic<size_t>> next(levels.size());
  if (threads == 1) {
    for (size_t l = 0; l < levels.size(); ++l) computeLevel(levels[l], next[l]);
  } else {
    const int workers = static_cast<int>(std::min<size_t>(threads, std::max<size_t>(widest, 1)));
    Barrier barrier(workers);
    Pool::instance().run(workers, [&](int) {
      for (size_t l = 0; l < levels.size(); ++l) {
        computeLevel(levels[l], next[l]);
        barrier.wait();
      }
    });
  }
  {
    std::lock_guard<std::mutex> guard(impl_->mutex);
    impl_->lastThreads.clear();
    for (int t = 0; t < run.threads(); ++t) impl_->lastThreads.push_back(t);
  }

  const Item *first = nullptr;
  int failed = 0;
  for (const auto &level : levels)
    for (int i : level)
      if (items[i].failed && !failed++) first = &items[i];
  if (!first) return VStatus::kSuccess;
  if (failed == 1) return first->failure;
  return graph::failure(first->failure.statusCode(),
                        std::string(first->failure.errorString().asUTF8()) + " (and " +
                            std::to_string(failed - 1) + " more failed)");
}

std::vector<int> Graph::lastEvaluationThreads() const {
  std::lock_guard<std::mutex> guard(impl_->mutex);
  return impl_->lastThreads;
}

}  // namespace standin
