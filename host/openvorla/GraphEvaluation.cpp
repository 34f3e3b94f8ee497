// Evaluation of the whole graph: every dirty computed value, node by node in
// topological levels, the nodes of one level spread over a pool of threads.
//
// The nodes to compute are those with a dirty computed attribute. A node
// waits for the nodes upstream of it that are computed too, also through
// nodes in between that compute nothing; a node's level is one past the
// highest of those. A level's nodes go round-robin to the threads, which meet
// at a barrier before the next level, so every source a node reads is
// computed (or has failed) before the node starts. A node downstream of a
// failed one is not computed: it stays dirty, as the failed value does.
//
// The pool has as many threads as asked for, or as the widest level has nodes
// if fewer. The caller waits for them, so it must not hold the interpreter
// lock, which their computes of script nodes take.
#include <standin/Graph.h>

#include <algorithm>
#include <condition_variable>
#include <map>
#include <set>
#include <thread>

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
  std::map<const graph::Node *, int> index;
  for (const graph::NodePtr &n : g.nodes) {
    Item item;
    for (size_t a = 0; a < n->slots.size(); ++a)
      if (n->type->attributes[a].computed && !n->slots[a]->isClean())
        item.dirty.push_back(static_cast<int>(a));
    if (item.dirty.empty()) continue;
    item.node = n;
    index[n.get()] = static_cast<int>(items.size());
    items.push_back(std::move(item));
  }
  for (Item &item : items) {
    std::vector<const graph::Node *> work{item.node.get()};
    std::set<const graph::Node *> seen{item.node.get()};
    while (!work.empty()) {
      const graph::Node *n = work.back();
      work.pop_back();
      for (const graph::Connection &c : g.connections) {
        if (c.destination != n || !seen.insert(c.source).second) continue;
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

int levelOf(std::vector<Item> &items, int i) {
  Item &item = items[i];
  if (item.level < 0) {
    int level = 0;
    for (int u : item.upstream) level = std::max(level, levelOf(items, u) + 1);
    item.level = level;
  }
  return item.level;
}

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
  std::vector<std::vector<int>> levels;
  for (int i = 0; i < static_cast<int>(items.size()); ++i) {
    size_t level = static_cast<size_t>(levelOf(items, i));
    if (levels.size() <= level) levels.resize(level + 1);
    levels[level].push_back(i);
  }
  size_t widest = 0;
  for (const auto &level : levels) widest = std::max(widest, level.size());

  Run run;
  if (threads == 1) {
    for (const auto &level : levels)
      for (int i : level) computeItem(*impl_, items, items[i], run);
  } else {
    const int workers = static_cast<int>(std::min<size_t>(threads, std::max<size_t>(widest, 1)));
    Barrier barrier(workers);
    std::vector<std::thread> pool;
    for (int t = 0; t < workers; ++t)
      pool.emplace_back([&, t] {
        for (const auto &level : levels) {
          for (size_t i = t; i < level.size(); i += workers)
            computeItem(*impl_, items, items[level[i]], run);
          barrier.wait();
        }
      });
    for (std::thread &t : pool) t.join();
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
