// The mechanism behind a set of resource strings: the library's own texts, fixed at compile time,
// and the replacements installed at run time (for translation). The foundation's message table
// and the statistics report labels each own one table, held in a function-local static (TableOf),
// so no table depends on the order in which the library's objects are initialised.
#pragma once

#include <array>
#include <cstddef>
#include <mutex>
#include <optional>
#include <shared_mutex>
#include <stdexcept>
#include <string>
#include <utility>

namespace tovrin::detail {

struct ResString {
  const char* name;  // the identifier as written, e.g. "rsVectorIsEmpty"
  const char* text;  // the library's own text
};

// Load, Set and Reset are safe to call from several threads: a raise on one thread may read
// while another installs a translation. An index past the table raises std::out_of_range.
template <std::size_t N>
class ResStringTable {
 public:
  explicit ResStringTable(const std::array<ResString, N>& strings) : strings_(strings) {}

  std::string Load(std::size_t index) const {
    const std::size_t at = Checked(index);
    std::shared_lock lock(mutex_);
    const auto& text = overrides_[at];
    return text ? *text : std::string(strings_[at].text);
  }
  void Set(std::size_t index, std::string text) {
    const std::size_t at = Checked(index);
    std::unique_lock lock(mutex_);
    overrides_[at] = std::move(text);
  }
  void Reset() {
    std::unique_lock lock(mutex_);
    for (auto& text : overrides_) text.reset();
  }
  const char* Name(std::size_t index) const { return strings_[Checked(index)].name; }

 private:
  static std::size_t Checked(std::size_t index) {
    if (index >= N) throw std::out_of_range("not a resource string identifier");
    return index;
  }

  const std::array<ResString, N>& strings_;
  mutable std::shared_mutex mutex_;
  std::array<std::optional<std::string>, N> overrides_;
};

// The one table of Strings, made on first use.
template <std::size_t N, const std::array<ResString, N>& Strings>
ResStringTable<N>& TableOf() {
  static ResStringTable<N> table(Strings);
  return table;
}

}  // namespace tovrin::detail
