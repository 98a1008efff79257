#include "tools/Registry.h"

#include <algorithm>

#include "tools/Descriptions.h"

namespace tovrin::cli {

std::vector<const Callable*> FindCallables(const CallableTable& Table, const std::string& Name) {
  std::vector<const Callable*> found;
  for (const Callable& entry : Table) {
    if (entry.name == Name) found.push_back(&entry);
  }
  return found;
}

namespace {
std::string Signature(const Callable& Entry) {
  std::string text = Entry.name;
  for (const std::string& param : Entry.params) text += " " + param;
  if (Entry.variadic) text += "...";
  return text;
}
}  // namespace

std::function<std::string()> BindByName(const CallableTable& Table, const std::string& What,
                                        const std::string& Name,
                                        std::span<const std::string> Arguments) {
  const std::vector<const Callable*> found = FindCallables(Table, Name);
  if (found.empty()) {
    throw UsageError("unknown " + What + " '" + Name + "' (the names are case-sensitive)");
  }
  bool other_overload = false;
  for (const Callable* entry : found) {
    if (entry->variadic || entry->params.size() == Arguments.size()) {
      try {
        return entry->bind(Arguments);
      } catch (const OtherOverload&) {
        other_overload = true;
      }
    }
  }
  if (other_overload) throw UsageError(Name + " has no form for those money types");
  std::string message = Name + " does not take " + std::to_string(Arguments.size()) + " argument" +
                        (Arguments.size() == 1 ? "" : "s") + "; it takes:";
  for (const Callable* entry : found) message += "\n  " + Signature(*entry);
  throw UsageError(message);
}

std::string ListCallables(const CallableTable& Table) {
  // The descriptions start in one column, after the longest signature (up to a limit).
  constexpr std::size_t kWidest = 40;
  std::size_t width = 0;
  for (const Callable& entry : Table) width = std::max(width, Signature(entry).size());
  width = std::min(width, kWidest) + 2;
  std::string text;
  for (const Callable& entry : Table) {
    std::string line = Signature(entry);
    const std::string_view description = Description(entry.name);
    if (!description.empty()) {
      line.resize(std::max(line.size() + 2, width), ' ');
      line += description;
    }
    text += line + "\n";
  }
  return text;
}

}  // namespace tovrin::cli
