// Shared by the editing controls' tests: a table of commands, each run on a fresh control set to
// its start, with what it must leave.
#pragma once

#include <gtest/gtest.h>

#include <QSignalSpy>
#include <functional>
#include <type_traits>

#include "tovrin/foundation/TOVRINErrors.h"

namespace tovrin::testing {

// Outcome: the contents after a success, or the identifier a failure names.
template <typename Edit, typename Contents, typename Outcome>
struct CommandCase {
  const char* name;
  Contents start;
  std::function<bool(Edit&)> command;
  Outcome outcome;
};

// Set puts the start into the control. A success returns true, leaves the contents Outcome, a
// row per model row and no null cell, and emits Changed once and no error. A failure returns
// false, emits one MathErrorRaised(message, identifier) and no Changed, and leaves every cell,
// nulls included, as it was.
template <typename Edit, typename Contents, typename Outcome, typename Set>
void RunCommands(std::initializer_list<CommandCase<Edit, Contents, Outcome>> cases, Set set,
                 Contents (Edit::*contents)() const) {
  for (const auto& c : cases) {
    SCOPED_TRACE(c.name);
    Edit edit;
    set(edit, c.start);
    const Contents before = (edit.*contents)();
    const bool nulls = edit.HasNulls();
    QSignalSpy changed(&edit, &Edit::Changed);
    QSignalSpy errors(&edit, &Edit::MathErrorRaised);
    if constexpr (std::is_same_v<Outcome, TResStringId>) {
      EXPECT_FALSE(c.command(edit));
      EXPECT_EQ((edit.*contents)(), before);
      EXPECT_EQ(edit.HasNulls(), nulls);
      EXPECT_EQ(changed.count(), 0);
      ASSERT_EQ(errors.count(), 1);
      EXPECT_EQ(errors[0][1].toInt(), c.outcome);
      EXPECT_EQ(errors[0][0].toString().toStdString(), LoadResString(c.outcome));
    } else {
      EXPECT_TRUE(c.command(edit));
      EXPECT_EQ((edit.*contents)(), c.outcome);
      EXPECT_EQ(edit.model()->rowCount(), static_cast<int>(c.outcome.size()));
      EXPECT_FALSE(edit.HasNulls());
      EXPECT_EQ(changed.count(), 1);
      EXPECT_EQ(errors.count(), 0);
    }
  }
}

}  // namespace tovrin::testing
