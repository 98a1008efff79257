// tovrin: the library's statistics, functions and random variates from a shell.
#include <cstdio>
#include <exception>
#include <new>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "tools/CommandLine.h"
#include "tools/Subcommands.h"
#include "tovrin/foundation/TOVRINErrors.h"

#ifndef TOVRIN_VERSION
#error "TOVRIN_VERSION must name the project version"
#endif

namespace tovrin::cli {
namespace {

constexpr std::string_view kHelp =
    "Usage: tovrin SUBCOMMAND [ARG...]\n"
    "       tovrin --help | --version\n"
    "\n"
    "Subcommands:\n"
    "  describe [OPTION...] [FILE...]\n"
    "             descriptive statistics of numbers, or of the fields of a table\n"
    "             (-t , -H -f temperature -g city; see 'tovrin describe --help')\n"
    "  regress [OPTION...] [FILE...]\n"
    "             correlation and regression of pairs 'x y', one pair per line, or of\n"
    "             two fields of a table (-t , -H -f height,weight)\n"
    "  grouped --start S --width W [--decimals N] FREQ...\n"
    "             statistics of grouped data given as class frequencies\n"
    "  eval FUNCTION [ARG...]     (eval --list shows the functions)\n"
    "             calls a scalar function of the library by its name\n"
    "  random GENERATOR [PARAM...] [--count N] [--seed S]\n"
    "             random variates of a generator (random --list shows them)\n"
    "\n"
    "Numbers are read from the FILEs named, or from standard input when none is named or\n"
    "the name is '-'; they are separated by white space, commas or line ends, and '#'\n"
    "starts a comment. 'tovrin SUBCOMMAND --help' describes each subcommand.\n"
    "\n"
    "Exit status: 0 on success, 1 when the input is not numbers or the library raises an\n"
    "error, 2 for a usage error.\n";

struct Subcommand {
  std::string_view name;
  int (*run)(std::span<const std::string>);
};

constexpr Subcommand kSubcommands[] = {
    {"describe", RunDescribe}, {"regress", RunRegress}, {"grouped", RunGrouped},
    {"eval", RunEval},         {"random", RunRandom},
};

int Fail(int Status, const std::string& Message) {
  std::fflush(stdout);
  std::fprintf(stderr, "tovrin: %s\n", Message.c_str());
  return Status;
}

int Run(const std::vector<std::string>& Words) {
  if (Words.empty()) {
    std::fputs(kHelp.data(), stderr);
    return kExitUsage;
  }
  const std::string& first = Words[0];
  if (first == "--help" || first == "-h" || first == "help") {
    WriteOut(std::string(kHelp));
    return kExitOk;
  }
  if (first == "--version") {
    WriteOut("tovrin " TOVRIN_VERSION "\n");
    return kExitOk;
  }
  for (const Subcommand& sub : kSubcommands) {
    if (first == sub.name) {
      try {
        return sub.run(std::span<const std::string>(Words).subspan(1));
      } catch (const UsageError& e) {
        return Fail(kExitUsage, std::string(e.what()) + "\nTry 'tovrin " + first + " --help'.");
      }
    }
  }
  return Fail(kExitUsage, "unknown subcommand '" + first + "'\nTry 'tovrin --help'.");
}

}  // namespace

void WriteOut(const std::string& Text) {
  if (std::fwrite(Text.data(), 1, Text.size(), stdout) != Text.size() || std::fflush(stdout) != 0) {
    throw std::runtime_error("cannot write to standard output");
  }
}

}  // namespace tovrin::cli

int main(int argc, char** argv) {
  using namespace tovrin::cli;
  try {
    return Run(std::vector<std::string>(argv + 1, argv + argc));
  } catch (const UsageError& e) {
    return Fail(kExitUsage, e.what());
  } catch (const InputError& e) {
    return Fail(kExitFailure, e.what());
  } catch (const tovrin::EMathError& e) {
    return Fail(kExitFailure, std::string("error: ") + e.what());
  } catch (const std::bad_alloc&) {
    return Fail(kExitFailure, "out of memory");
  } catch (const std::exception& e) {
    return Fail(kExitFailure, e.what());
  }
}
