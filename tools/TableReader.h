// Reading delimited tables: records of fields from files and standard input.
//
// A table is read one record at a time through a fixed buffer, so memory does not grow with
// the file. Fields are views into that buffer, valid until the next record is read; no field
// is copied or allocated. With a delimiter character, fields may be quoted with '"' as in
// RFC 4180: a quoted field may hold the delimiter, line ends and doubled quotes ("" is one
// quote). With blanks as separators, fields are the runs of characters between runs of
// spaces and tabs. Either way a '\r' before a line end is dropped and blank lines are skipped.
#pragma once

#include <cstddef>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace tovrin::cli {

// How the fields of a record are separated.
struct TableFormat {
  bool whitespace = true;  // runs of blanks; otherwise the delimiter
  char delimiter = ',';
};

// The delimiter given to -t: one character, "tab", or the escape "\t". Raises UsageError
// naming the option otherwise.
char ParseDelimiter(std::string_view Text);

// The records of one source ("-" is standard input), in order.
class RecordReader {
 public:
  // Opens the source; raises InputError when it cannot be opened.
  RecordReader(const std::string& Source, TableFormat Format);
  ~RecordReader();
  RecordReader(const RecordReader&) = delete;
  RecordReader& operator=(const RecordReader&) = delete;

  // Reads the next record; false at the end of the source. Raises InputError when the source
  // cannot be read or ends inside a quoted field.
  bool Next();
  // The line on which the current record starts (1-based).
  std::size_t Line() const { return record_line_; }
  const std::vector<std::string_view>& Fields() const { return fields_; }
  // The source's name in messages: "<stdin>" for "-".
  const std::string& Name() const { return name_; }

 private:
  bool Fill();
  bool FindRecordEnd(std::size_t& End, std::size_t& Lines) const;
  void SplitDelimited(char* First, char* Last);
  void SplitBlanks(const char* First, const char* Last);

  TableFormat format_;
  std::string name_;
  int fd_ = -1;
  bool close_fd_ = false;
  bool at_eof_ = false;
  std::unique_ptr<char[]> buffer_;
  std::size_t capacity_ = 0;
  std::size_t begin_ = 0;  // the unread data is buffer_[begin_, end_)
  std::size_t end_ = 0;
  std::size_t next_line_ = 1;
  std::size_t record_line_ = 0;
  std::vector<std::string_view> fields_;
};

}  // namespace tovrin::cli
