#include "tovrin/widgets/TOVRINVectorEdit.h"

#include <gtest/gtest.h>

#include <QLineEdit>
#include <QSignalSpy>
#include <QTest>

#include "tovrin/widgets/TOVRINWidgets_testing.h"

namespace tovrin {
namespace {

QString Cell(const TQENVectorEdit& edit, int row, int col = 0) {
  return edit.model()->index(row, col).data().toString();
}

// A trailing null cell must survive a failure too (an empty vector stays empty).
TEST(VectorEditCommands, FailureLeavesContentsAndReportsTheIdentifier) {
  testing::RunCommands<TQENVectorEdit, TQENFloatVector, TResStringId>(
      {{"Sqrt of -4", {1, -4, 9}, [](auto& e) { return e.Sqrt(); }, rsVectorNeg},
       {"Invert of 0", {2, 0}, [](auto& e) { return e.Invert(); }, rsVectorZero},
       {"Ln of 0", {3, 0, 1}, [](auto& e) { return e.Ln(); }, rsVectorNotPos},
       {"Log10 of -1", {5, -1}, [](auto& e) { return e.Log10(); }, rsVectorNotPos},
       {"Sqr of nothing", {}, [](auto& e) { return e.Sqr(); }, rsVectorIsEmpty},
       {"LinearTransform", {}, [](auto& e) { return e.LinearTransform(2, 1); }, rsVectorIsEmpty},
       {"Delete past the end", {1, 2}, [](auto& e) { return e.Delete(3); }, rsInvalidValue},
       {"Delete before the start", {1, 2}, [](auto& e) { return e.Delete(-1); }, rsInvalidValue}},
      [](TQENVectorEdit& e, const TQENFloatVector& v) {
        e.SetVector(v);
        if (!v.empty()) e.SetCount(e.Count() + 1);
      },
      &TQENVectorEdit::Vector);
}

// Values chosen so that every result is exact.
TEST(VectorEditCommands, SuccessRewritesOnceAndLeavesNoNulls) {
  testing::RunCommands<TQENVectorEdit, TQENFloatVector, TQENFloatVector>(
      {{"Sort ascending", {3, -1, 2}, [](auto& e) { return e.Sort(); }, {-1, 2, 3}},
       {"Sort descending", {3, -1, 2}, [](auto& e) { return e.Sort(false); }, {3, 2, -1}},
       {"Reverse", {1, 2, 3}, [](auto& e) { return e.Reverse(); }, {3, 2, 1}},
       {"Fill", {1, 2}, [](auto& e) { return e.Fill(7); }, {7, 7}},
       {"Sqr", {-3, 0.5}, [](auto& e) { return e.Sqr(); }, {9, 0.25}},
       {"Sqrt", {4, 0.25}, [](auto& e) { return e.Sqrt(); }, {2, 0.5}},
       {"Invert", {2, -0.25}, [](auto& e) { return e.Invert(); }, {0.5, -4}},
       {"Ln of 1", {1}, [](auto& e) { return e.Ln(); }, {0}},
       {"LinearTransform", {1, -1.5}, [](auto& e) { return e.LinearTransform(2, 1); }, {3, -2}},
       {"Append", {1}, [](auto& e) { return e.Append(5); }, {1, 5}},
       {"Insert", {1, 2}, [](auto& e) { return e.Insert(1, 9); }, {1, 9, 2}},
       {"Insert past the end appends", {1}, [](auto& e) { return e.Insert(8, 9); }, {1, 9}},
       {"Delete", {1, 2, 3}, [](auto& e) { return e.Delete(0); }, {2, 3}}},
      [](TQENVectorEdit& e, const TQENFloatVector& v) { e.SetVector(v); }, &TQENVectorEdit::Vector);
}

TEST(VectorEditNulls, ReadAsZeroAndBecomeRealZerosUnderACommand) {
  TQENVectorEdit edit;
  edit.SetVector({2});
  edit.SetCount(3);
  EXPECT_TRUE(edit.HasNulls());
  EXPECT_EQ(Cell(edit, 1), QString(QENNullStr));
  EXPECT_EQ(edit.Vector(), (TQENFloatVector{2, 0, 0}));
  ASSERT_TRUE(edit.Sqr());
  EXPECT_FALSE(edit.HasNulls());
  EXPECT_EQ(Cell(edit, 1), "0.0000");
  ASSERT_TRUE(edit.Clear());
  EXPECT_EQ(edit.Count(), 3);
  EXPECT_TRUE(edit.IsNull(0) && edit.IsNull(2));
}

TEST(VectorEditCells, TextIsStoredRefusedOrClearedWithOneSignalEach) {
  TQENVectorEdit edit;
  edit.SetVector({1.5, 2});
  edit.SetDecimals(2);
  QSignalSpy changed(&edit, &TQENVectorEdit::Changed);
  QSignalSpy errors(&edit, &TQENVectorEdit::MathErrorRaised);
  const QModelIndex first = edit.model()->index(0, 0);

  EXPECT_TRUE(edit.model()->setData(first, " -2.25e1 "));
  EXPECT_EQ(edit.Vector()[0], -22.5L);
  EXPECT_EQ(Cell(edit, 0), "-22.50");
  EXPECT_EQ(changed.count(), 1);

  for (const char* bad : {"1,5", "abc", "0x10", "inf", "1/2"}) {
    SCOPED_TRACE(bad);
    EXPECT_FALSE(edit.model()->setData(first, bad));
    EXPECT_EQ(edit.Vector()[0], -22.5L);
    ASSERT_FALSE(errors.isEmpty());
    EXPECT_EQ(errors.last()[1].toInt(), -1);
    EXPECT_TRUE(errors.last()[0].toString().contains(bad));
  }
  EXPECT_EQ(errors.count(), 5);
  EXPECT_EQ(changed.count(), 1);

  // The editor opens on the full value: confirming it unchanged is no change.
  EXPECT_TRUE(edit.model()->setData(first, first.data(Qt::EditRole)));
  EXPECT_EQ(changed.count(), 1);

  EXPECT_TRUE(edit.model()->setData(first, ""));
  EXPECT_TRUE(edit.IsNull(0));
  EXPECT_EQ(Cell(edit, 0), QString(QENNullStr));
  EXPECT_EQ(changed.count(), 2);

  edit.SetReadOnly(true);
  EXPECT_FALSE(edit.model()->setData(first, "4"));
  EXPECT_FALSE(edit.model()->flags(first) & Qt::ItemIsEditable);
  EXPECT_TRUE(edit.Fill(1));  // commands still run
}

TEST(VectorEditKeyboard, TypingIntoACellStoresTheNumberAndDeleteMakesNulls) {
  TQENVectorEdit edit;
  edit.SetVector({1, 2, 3});
  edit.show();
  QSignalSpy changed(&edit, &TQENVectorEdit::Changed);
  edit.setCurrentIndex(edit.model()->index(1, 0));
  QTest::keyClick(&edit, Qt::Key_4);  // opens the editor on the current cell
  auto* editor = edit.findChild<QLineEdit*>();
  ASSERT_NE(editor, nullptr);
  QTest::keyClicks(editor, ".75");
  QTest::keyClick(editor, Qt::Key_Return);
  QCoreApplication::processEvents();  // the delegate commits through a queued call
  EXPECT_EQ(edit.Vector(), (TQENFloatVector{1, 4.75, 3}));
  EXPECT_EQ(changed.count(), 1);

  edit.selectionModel()->select(
      QItemSelection(edit.model()->index(0, 0), edit.model()->index(1, 0)),
      QItemSelectionModel::ClearAndSelect);
  QTest::keyClick(&edit, Qt::Key_Delete);
  EXPECT_TRUE(edit.IsNull(0) && edit.IsNull(1) && !edit.IsNull(2));
  EXPECT_EQ(changed.count(), 2);
}

TEST(LabelledVectorEdit, LabelsTravelWithTheirValuesAndMissingOnesReadNA) {
  TQENLabelledVectorEdit edit;
  edit.SetLabels({"c", "a"});  // before the values: kept for the rows to come
  edit.SetVector({3, 1, 2});
  EXPECT_EQ(Cell(edit, 2, 0).toStdString(), LoadResString(rsNA));
  ASSERT_TRUE(edit.Sort());
  EXPECT_EQ(edit.Vector(), (TQENFloatVector{1, 2, 3}));
  EXPECT_EQ(edit.Labels(), (QStringList{"a", "", "c"}));
  ASSERT_TRUE(edit.Delete(0));
  ASSERT_TRUE(edit.Insert(0, 5));
  EXPECT_EQ(edit.Labels(), (QStringList{"", "", "c"}));
  EXPECT_EQ(Cell(edit, 0, 1), "5.0000");
}

}  // namespace
}  // namespace tovrin
