// The subcommands of the tovrin program. Each takes the words after its name, writes its
// result on standard output, and returns the exit status; failures leave by UsageError,
// InputError or the library's own exceptions, which main() reports.
#pragma once

#include <span>
#include <string>

namespace tovrin::cli {

int RunDescribe(std::span<const std::string> Words);
int RunRegress(std::span<const std::string> Words);
int RunGrouped(std::span<const std::string> Words);
int RunEval(std::span<const std::string> Words);
int RunRandom(std::span<const std::string> Words);

// Writes Text to standard output in one piece.
void WriteOut(const std::string& Text);

}  // namespace tovrin::cli
