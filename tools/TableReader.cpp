#include "tools/TableReader.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>

#include "tools/CommandLine.h"
#include "tools/NumberReader.h"

namespace tovrin::cli {
namespace {

constexpr std::size_t kInitialBuffer = 1 << 20;

bool IsBlank(char c) { return c == ' ' || c == '\t'; }

}  // namespace

char ParseDelimiter(std::string_view Text) {
  if (Text == "tab" || Text == "TAB" || Text == "\\t") return '\t';
  if (Text.size() != 1 || Text[0] == '"' || Text[0] == '\n' || Text[0] == '\r') {
    throw UsageError("-t/--delimiter takes one character (or 'tab' or '\\t'), not '" +
                     std::string(Text) + "'");
  }
  return Text[0];
}

RecordReader::RecordReader(const std::string& Source, TableFormat Format)
    : format_(Format), name_(SourceName(Source)) {
  const bool from_stdin = Source == "-";
  fd_ = from_stdin ? STDIN_FILENO : ::open(Source.c_str(), O_RDONLY | O_CLOEXEC);
  if (fd_ < 0) throw InputError(name_ + ": cannot open: " + std::strerror(errno));
  close_fd_ = !from_stdin;
  buffer_.reset(new char[kInitialBuffer]);
  capacity_ = kInitialBuffer;
}

RecordReader::~RecordReader() {
  if (close_fd_) ::close(fd_);
}

// Moves the unread data to the front of the buffer (doubling it when the data fills it) and
// reads more behind it. False at the end of the source.
bool RecordReader::Fill() {
  if (at_eof_) return false;
  const std::size_t kept = end_ - begin_;
  if (kept == capacity_) {
    std::unique_ptr<char[]> larger(new char[2 * capacity_]);
    std::memcpy(larger.get(), buffer_.get() + begin_, kept);
    buffer_ = std::move(larger);
    capacity_ *= 2;
  } else if (begin_ != 0) {
    std::memmove(buffer_.get(), buffer_.get() + begin_, kept);
  }
  begin_ = 0;
  end_ = kept;
  for (;;) {
    const ssize_t got = ::read(fd_, buffer_.get() + end_, capacity_ - end_);
    if (got < 0) {
      if (errno == EINTR) continue;
      throw InputError(name_ + ": cannot read: " + std::strerror(errno));
    }
    if (got == 0) {
      at_eof_ = true;
      return false;
    }
    end_ += static_cast<std::size_t>(got);
    return true;
  }
}

// Finds the end of the record that starts at begin_: the position of its line end, or end_
// when the source ends without one. Lines counts the line ends inside quoted fields. False
// when the buffer holds only part of the record and more can be read.
bool RecordReader::FindRecordEnd(std::size_t& End, std::size_t& Lines) const {
  const char* const data = buffer_.get();
  const char* const first = data + begin_;
  const char* const last = data + end_;
  Lines = 0;
  const void* newline = std::memchr(first, '\n', static_cast<std::size_t>(last - first));
  const char* const line_end = newline ? static_cast<const char*>(newline) : last;
  if (format_.whitespace ||
      std::memchr(first, '"', static_cast<std::size_t>(line_end - first)) == nullptr) {
    if (!newline && !at_eof_) return false;
    End = static_cast<std::size_t>(line_end - data);
    return true;
  }
  // Quotes: a quote opens a quoted field only at the start of a field, and closes it when it
  // is not doubled.
  const char d = format_.delimiter;
  bool field_start = true;
  for (const char* p = first; p != last; ++p) {
    const char c = *p;
    if (field_start && c == '"') {
      for (++p;; ++p) {
        if (p == last) {
          if (!at_eof_) return false;
          throw InputError(name_ + ":" + std::to_string(next_line_) +
                           ": a quoted field is not closed before the end of the input");
        }
        if (*p == '\n') ++Lines;
        if (*p == '"') {
          if (p + 1 == last && !at_eof_) return false;
          if (p + 1 == last || p[1] != '"') break;
          ++p;
        }
      }
      field_start = false;
      continue;
    }
    if (c == '\n') {
      End = static_cast<std::size_t>(p - data);
      return true;
    }
    field_start = c == d;
  }
  if (!at_eof_) return false;
  End = end_;
  return true;
}

bool RecordReader::Next() {
  for (;;) {
    std::size_t end = 0, lines = 0;
    if (begin_ == end_) {
      if (!Fill()) return false;
      continue;
    }
    if (!FindRecordEnd(end, lines)) {
      Fill();
      continue;
    }
    char* const first = buffer_.get() + begin_;
    char* last = buffer_.get() + end;
    record_line_ = next_line_;
    next_line_ += lines + (end < end_ ? 1 : 0);
    begin_ = end < end_ ? end + 1 : end;
    if (last != first && last[-1] == '\r') --last;
    if (format_.whitespace) {
      SplitBlanks(first, last);
      if (fields_.empty()) continue;
    } else {
      if (last == first) continue;
      SplitDelimited(first, last);
    }
    return true;
  }
}

// Quoted fields are unquoted in place: the text without its quotes is never longer.
void RecordReader::SplitDelimited(char* First, char* Last) {
  fields_.clear();
  const char d = format_.delimiter;
  char* p = First;
  for (;;) {
    if (p != Last && *p == '"') {
      char* const start = p;
      char* out = p;
      for (++p; p != Last; ++p) {
        if (*p == '"') {
          if (p + 1 == Last || p[1] != '"') {
            ++p;
            break;
          }
          ++p;
        }
        *out++ = *p;
      }
      // Text after the closing quote (not RFC 4180) is kept as it stands.
      while (p != Last && *p != d) *out++ = *p++;
      fields_.emplace_back(start, static_cast<std::size_t>(out - start));
    } else {
      char* const start = p;
      const void* next = std::memchr(p, d, static_cast<std::size_t>(Last - p));
      p = next ? static_cast<char*>(const_cast<void*>(next)) : Last;
      fields_.emplace_back(start, static_cast<std::size_t>(p - start));
    }
    if (p == Last) return;
    ++p;
  }
}

void RecordReader::SplitBlanks(const char* First, const char* Last) {
  fields_.clear();
  const char* p = First;
  for (;;) {
    while (p != Last && IsBlank(*p)) ++p;
    if (p == Last) return;
    const char* const start = p;
    while (p != Last && !IsBlank(*p)) ++p;
    fields_.emplace_back(start, static_cast<std::size_t>(p - start));
  }
}

}  // namespace tovrin::cli
