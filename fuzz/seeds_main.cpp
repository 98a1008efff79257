// Picks a small seed set out of corpus folders: runs every input once, notes which instrumented
// edges it reached, then takes the input reaching the most edges not yet covered, again and
// again, until the chosen inputs reach every edge any input reached (greedy set cover). Prints
// the chosen paths, one a line. libFuzzer's -merge=1 keeps every input that brings a new
// feature in size order, which leaves thousands of inputs with an edge or two each; this keeps
// the same edges with a few hundred.
//   <target>_seeds DIR_OR_FILE...
// Built with the fuzzers (-fsanitize=fuzzer-no-link gives the edge counters) but without
// libFuzzer, so the counters are registered here.
#include <algorithm>
#include <cstdint>
#include <cstdio>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <queue>
#include <string>
#include <utility>
#include <vector>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size);

namespace {

struct CounterRegion {
  std::uint8_t* begin;
  std::uint8_t* end;
};

std::vector<CounterRegion>& CounterRegions() {
  static std::vector<CounterRegion> regions;
  return regions;
}

// The indexes, over all counter regions, of the edges the last input reached.
std::vector<std::uint32_t> ReachedEdges() {
  std::vector<std::uint32_t> edges;
  std::uint32_t base = 0;
  for (const CounterRegion& r : CounterRegions()) {
    for (std::uint8_t* c = r.begin; c != r.end; ++c) {
      if (*c != 0) edges.push_back(base + static_cast<std::uint32_t>(c - r.begin));
    }
    base += static_cast<std::uint32_t>(r.end - r.begin);
  }
  return edges;
}

void ClearCounters() {
  for (const CounterRegion& r : CounterRegions()) std::memset(r.begin, 0, r.end - r.begin);
}

}  // namespace

extern "C" void __sanitizer_cov_8bit_counters_init(std::uint8_t* begin, std::uint8_t* end) {
  if (begin != end) CounterRegions().push_back({begin, end});
}

int main(int argc, char** argv) {
  std::vector<std::filesystem::path> files;
  for (int i = 1; i < argc; ++i) {
    if (std::filesystem::is_directory(argv[i])) {
      for (const auto& entry : std::filesystem::directory_iterator(argv[i])) {
        if (entry.is_regular_file()) files.push_back(entry.path());
      }
    } else {
      files.emplace_back(argv[i]);
    }
  }
  // Sorted so that ties go to the same input on every run.
  std::sort(files.begin(), files.end());

  std::vector<std::vector<std::uint32_t>> reached(files.size());
  std::uint32_t edge_count = 0;
  for (const CounterRegion& r : CounterRegions()) edge_count += r.end - r.begin;
  for (std::size_t i = 0; i < files.size(); ++i) {
    std::ifstream in(files[i], std::ios::binary);
    const std::vector<char> bytes{std::istreambuf_iterator<char>(in), {}};
    ClearCounters();
    LLVMFuzzerTestOneInput(reinterpret_cast<const std::uint8_t*>(bytes.data()), bytes.size());
    reached[i] = ReachedEdges();
  }

  // Lazy greedy: an input's count of new edges only falls as others are chosen, so a stale
  // count at the top of the queue is refreshed and pushed back until the top is current.
  std::vector<bool> covered(edge_count, false);
  std::priority_queue<std::pair<std::size_t, std::size_t>> queue;  // (new edges, -index)
  for (std::size_t i = 0; i < files.size(); ++i) {
    if (!reached[i].empty()) queue.push({reached[i].size(), files.size() - i});
  }
  std::size_t chosen = 0;
  while (!queue.empty()) {
    const auto [count, key] = queue.top();
    queue.pop();
    const std::size_t i = files.size() - key;
    const auto fresh = static_cast<std::size_t>(std::count_if(
        reached[i].begin(), reached[i].end(), [&](std::uint32_t e) { return !covered[e]; }));
    if (fresh == 0) continue;
    if (fresh < count) {
      queue.push({fresh, key});
      continue;
    }
    for (std::uint32_t e : reached[i]) covered[e] = true;
    std::printf("%s\n", files[i].c_str());
    ++chosen;
  }
  std::fprintf(stderr, "%zu of %zu inputs reach all %zu edges any input reaches\n", chosen,
               files.size(),
               static_cast<std::size_t>(std::count(covered.begin(), covered.end(), true)));
  return 0;
}
