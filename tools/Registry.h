// Tables of the library's functions, callable by name with arguments given as text.
//
// An entry is registered only when the library declares a function of that name callable
// with the listed argument types, so the tables list exactly what the library offers.
#pragma once

#include <array>
#include <cstdint>
#include <functional>
#include <limits>
#include <span>
#include <string>
#include <tuple>
#include <type_traits>
#include <utility>
#include <vector>

#include "tools/CommandLine.h"
#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin::cli {

// One signature of a function: its name, the names of its arguments, and how to bind it to
// arguments given as text. A bound call produces one result as text each time it runs (a
// random generator draws anew on every run).
struct Callable {
  std::string name;
  std::vector<std::string> params;  // empty and variadic: see `variadic`
  bool variadic = false;
  std::function<std::function<std::string()>(std::span<const std::string>)> bind;
};

using CallableTable = std::vector<Callable>;

// Wraps a library function so that the table can test whether it exists: the call is
// looked up only when the lambda is instantiated with the argument types.
#define TOVRIN_CALLABLE(Name) [](auto&&... a) -> decltype(Name(a...)) { return Name(a...); }

// Raised while binding when a money argument names another money type than the signature's:
// the next signature of the same name is tried.
struct OtherOverload {};

template <typename T>
constexpr const char* MoneyTypeName() {
  if constexpr (std::is_same_v<T, TQENCurrency>)
    return "TQENCurrency";
  else if constexpr (std::is_same_v<T, TQENLongCurrency>)
    return "TQENLongCurrency";
  else
    return "Currency";
}

template <typename T>
T ParseArgument(const std::string& Text, const std::string& Name) {
  if constexpr (std::is_enum_v<T>) {
    // Money is written as its stored integer, optionally tagged with its type
    // ("Currency:15000" is the Currency amount 1.5), which chooses among overloads.
    std::string digits = Text;
    if (const auto colon = Text.find(':'); colon != std::string::npos) {
      const std::string type = Text.substr(0, colon);
      if (type != "TQENCurrency" && type != "TQENLongCurrency" && type != "Currency") {
        throw UsageError(Name + ": unknown money type '" + type + "'");
      }
      if (type != MoneyTypeName<T>()) throw OtherOverload{};
      digits = Text.substr(colon + 1);
    }
    using Stored = std::underlying_type_t<T>;
    return static_cast<T>(static_cast<Stored>(ParseSignedArgument(
        digits, Name + " (" + MoneyTypeName<T>() + ", the stored integer)",
        std::numeric_limits<Stored>::min(), std::numeric_limits<Stored>::max())));
  } else if constexpr (std::is_same_v<T, Extended>) {
    return ParseRealArgument(Text, Name);
  } else if constexpr (std::is_same_v<T, bool>) {
    if (Text == "True" || Text == "true" || Text == "1") return true;
    if (Text == "False" || Text == "false" || Text == "0") return false;
    throw UsageError(Name + " must be True or False, not '" + Text + "'");
  } else if constexpr (std::is_unsigned_v<T>) {
    return static_cast<T>(ParseUnsignedArgument(Text, Name, std::numeric_limits<T>::max()));
  } else {
    return static_cast<T>(ParseSignedArgument(Text, Name, std::numeric_limits<T>::min(),
                                              std::numeric_limits<T>::max()));
  }
}

template <typename R>
std::string FormatResult(const R& Result) {
  if constexpr (std::is_same_v<R, bool>) {
    return Result ? "True" : "False";
  } else if constexpr (std::is_floating_point_v<R> || std::is_same_v<R, PackedExtended>) {
    return FormatSignificant(static_cast<Extended>(Result));
  } else if constexpr (std::is_integral_v<R>) {
    return std::to_string(Result);
  } else if constexpr (std::is_enum_v<R>) {
    return std::to_string(static_cast<std::underlying_type_t<R>>(Result));
  } else {
    return std::string(Result);
  }
}

namespace detail {
template <typename... Args, typename F, std::size_t... I>
std::function<std::string()> BindScalar(F Function,
                                        [[maybe_unused]] std::span<const std::string> Text,
                                        [[maybe_unused]] const std::vector<std::string>& Params,
                                        std::index_sequence<I...>) {
  // Arguments are parsed once; the bound call keeps copies (an lvalue Extended serves the
  // generators that take their parameter by reference).
  return
      [Function, args = std::tuple<Args...>(ParseArgument<Args>(Text[I], Params[I])...)]() mutable {
        return FormatResult(std::apply(Function, args));
      };
}
}  // namespace detail

// Registers Name(Args...) returning a scalar, if the library has it.
template <typename... Args, typename F>
void AddScalar(CallableTable& Table, const char* Name,
               const std::array<const char*, sizeof...(Args)>& Params, F Function) {
  if constexpr (std::is_invocable_v<F, std::add_lvalue_reference_t<Args>...>) {
    Callable entry;
    entry.name = Name;
    entry.params.assign(Params.begin(), Params.end());
    entry.bind = [Function, params = entry.params](std::span<const std::string> text) {
      return detail::BindScalar<Args...>(Function, text, params,
                                         std::index_sequence_for<Args...>{});
    };
    Table.push_back(std::move(entry));
  }
}

// Registers a binding that takes any number of arguments.
inline void AddVariadic(
    CallableTable& Table, const char* Name, std::vector<std::string> Params,
    std::function<std::function<std::string()>(std::span<const std::string>)> Bind) {
  Table.push_back(Callable{Name, std::move(Params), true, std::move(Bind)});
}

// The signatures of Name in Table.
std::vector<const Callable*> FindCallables(const CallableTable& Table, const std::string& Name);
// Binds Name to the arguments: the signature whose argument count matches is chosen.
// Raises UsageError for an unknown name or a wrong argument count.
std::function<std::string()> BindByName(const CallableTable& Table, const std::string& What,
                                        const std::string& Name,
                                        std::span<const std::string> Arguments);
// One line per signature: "Name Param Param ..." and a one-line description.
std::string ListCallables(const CallableTable& Table);

// The precise distribution family (tovrin::precise), for eval --precise.
const CallableTable& PreciseEvalTable();

}  // namespace tovrin::cli
