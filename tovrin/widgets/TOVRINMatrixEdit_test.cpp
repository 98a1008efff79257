#include "tovrin/widgets/TOVRINMatrixEdit.h"

#include <gtest/gtest.h>

#include <QSignalSpy>

#include "tovrin/widgets/TOVRINMatrixFractEdit.h"
#include "tovrin/widgets/TOVRINWidgets_testing.h"
#include "tovrin/widgets/detail/GridCells.h"

namespace tovrin {
namespace {

// The element-wise functions stop at the failing element and keep what they already wrote;
// the control must not show that half-way state. Failing elements sit last for that reason.
TEST(MatrixEditCommands, FailureLeavesContentsAndReportsTheIdentifier) {
  testing::RunCommands<TQENMatrixEdit, TQENFloatMatrix, TResStringId>(
      {{"Sqrt", {{4, 9}, {16, -1}}, [](auto& e) { return e.Sqrt(); }, rsMatrixNeg},
       {"Invert", {{2, 4}, {8, 0}}, [](auto& e) { return e.Invert(); }, rsMatrixZero},
       {"Ln", {{1, 2}, {3, 0}}, [](auto& e) { return e.Ln(); }, rsMatrixNotPos},
       {"Log10", {{10, 100}, {-5, 1}}, [](auto& e) { return e.Log10(); }, rsMatrixNotPos},
       {"Sqr of nothing", {}, [](auto& e) { return e.Sqr(); }, rsMatrixIsEmpty},
       {"Inverse singular", {{1, 2}, {2, 4}}, [](auto& e) { return e.Inverse(); }, rsNoInvert},
       {"Inverse 2x3", {{1, 2, 3}, {4, 5, 6}}, [](auto& e) { return e.Inverse(); }, rsMatrixSqr},
       {"RowReduce of nothing", {}, [](auto& e) { return e.RowReduce(); }, rsMatrixIsEmpty},
       {"SwapRows", {{1, 2}, {3, 4}}, [](auto& e) { return e.SwapRows(0, 2); }, rsInvalidRow},
       {"SwapCols", {{1, 2}, {3, 4}}, [](auto& e) { return e.SwapCols(-1, 0); }, rsInvalidCol},
       {"ScaleRow past the end", {{1, 2}}, [](auto& e) { return e.ScaleRow(1, 2); }, rsInvalidRow},
       {"AddRows past the end", {{1, 2}}, [](auto& e) { return e.AddRows(0, 3, 1); }, rsInvalidRow},
       {"Identity of -1", {{1}}, [](auto& e) { return e.Identity(-1); }, rsInvalidValue}},
      [](TQENMatrixEdit& e, const TQENFloatMatrix& m) { e.SetMatrix(m); }, &TQENMatrixEdit::Matrix);
}

TEST(MatrixEditCommands, SuccessRewritesOnce) {
  testing::RunCommands<TQENMatrixEdit, TQENFloatMatrix, TQENFloatMatrix>(
      {{"Sqr", {{-2, 3}}, [](auto& e) { return e.Sqr(); }, {{4, 9}}},
       {"Sqrt", {{4, 0.25}}, [](auto& e) { return e.Sqrt(); }, {{2, 0.5}}},
       {"LinearTransform", {{1, 2}}, [](auto& e) { return e.LinearTransform(3, -1); }, {{2, 5}}},
       {"Transpose", {{1, 2, 3}}, [](auto& e) { return e.Transpose(); }, {{1}, {2}, {3}}},
       {"SwapRows", {{1, 2}, {3, 4}}, [](auto& e) { return e.SwapRows(0, 1); }, {{3, 4}, {1, 2}}},
       {"SwapCols", {{1, 2}, {3, 4}}, [](auto& e) { return e.SwapCols(0, 1); }, {{2, 1}, {4, 3}}},
       {"ScaleRow",
        {{1, 2}, {3, 4}},
        [](auto& e) { return e.ScaleRow(1, -2); },
        {{1, 2}, {-6, -8}}},
       {"AddRows",
        {{1, 2}, {3, 4}},
        [](auto& e) { return e.AddRows(1, 0, -3); },
        {{1, 2}, {0, -2}}},
       {"Inverse", {{2, 0}, {0, 4}}, [](auto& e) { return e.Inverse(); }, {{0.5, 0}, {0, 0.25}}},
       {"Identity", {{5}}, [](auto& e) { return e.Identity(2); }, {{1, 0}, {0, 1}}}},
      [](TQENMatrixEdit& e, const TQENFloatMatrix& m) { e.SetMatrix(m); }, &TQENMatrixEdit::Matrix);
}

TEST(MatrixEditShape, RaggedRowsAndNewCellsAreNullAndReadAsZero) {
  TQENMatrixEdit edit;
  edit.SetMatrix({{1, 2, 3}, {4}});
  EXPECT_EQ(edit.Cols(), 3);
  EXPECT_TRUE(edit.IsNull(1, 2) && !edit.IsNull(1, 0));
  EXPECT_EQ(edit.Matrix(), (TQENFloatMatrix{{1, 2, 3}, {4, 0, 0}}));
  edit.SetDimensions(3, 2);
  EXPECT_EQ(edit.Matrix(), (TQENFloatMatrix{{1, 2}, {4, 0}, {0, 0}}));
  EXPECT_TRUE(edit.IsNull(1, 1) && edit.IsNull(2, 0));
  ASSERT_TRUE(edit.ScaleRow(0, 2));
  EXPECT_FALSE(edit.HasNulls());
}

// det and rank by hand: [[2,1,1],[4,3,3],[8,7,9]] has det 2*6 - 1*12 + 1*4 = 4.
TEST(MatrixEditQueries, DeterminantAndRankLeaveTheContentsAndReportFailures) {
  TQENMatrixEdit edit;
  const TQENFloatMatrix m{{2, 1, 1}, {4, 3, 3}, {8, 7, 9}};
  edit.SetMatrix(m);
  QSignalSpy errors(&edit, &TQENMatrixEdit::MathErrorRaised);
  ASSERT_TRUE(edit.Determinant().has_value());
  EXPECT_NEAR(static_cast<double>(*edit.Determinant()), 4.0, 1e-15);
  EXPECT_EQ(edit.Rank(), 3);
  EXPECT_EQ(edit.Matrix(), m);
  edit.SetMatrix({{1, 2, 3}});
  EXPECT_FALSE(edit.Determinant().has_value());
  EXPECT_EQ(errors.count(), 1);
  edit.SetMatrix({});
  EXPECT_EQ(edit.Rank(), -1);
  ASSERT_EQ(errors.count(), 2);
  EXPECT_EQ(errors[1][1].toInt(), rsMatrixIsEmpty);
}

// Reduced by hand in exact fractions: pivot 8 (rows 0 and 2 swap), row 0 / 8, eliminate;
// pivot -3/4 (rows 1 and 2 swap), scale, eliminate; last pivot -2/3.
TEST(MatrixFractEdit, RowReducedIntegerMatrixReadsAsExactFractions) {
  TQENMatrixFractEdit edit;
  edit.SetMatrix({{2, 1, 1}, {4, 3, 3}, {8, 7, 9}});
  ASSERT_TRUE(edit.RowReduce());
  const char* expected[3][3] = {{"1", "7/8", "9/8"}, {"0", "1", "5/3"}, {"0", "0", "1"}};
  for (int r = 0; r < 3; ++r)
    for (int c = 0; c < 3; ++c)
      EXPECT_EQ(edit.model()->index(r, c).data().toString(), expected[r][c]) << r << "," << c;
}

TEST(MatrixFractEdit, FractionsAreTypedAndOthersShownAsDecimals) {
  TQENMatrixFractEdit edit;
  edit.SetDimensions(1, 1);
  QSignalSpy errors(&edit, &TQENMatrixEdit::MathErrorRaised);
  const QModelIndex cell = edit.model()->index(0, 0);
  struct Case {
    const char* typed;
    Extended value;
    const char* shown;
  };
  const Case cases[] = {
      {"2/3", 2.0L / 3, "2/3"}, {"-1/4", -0.25L, "-1/4"},          {" 7 ", 7, "7"},
      {"0.1", 0.1L, "1/10"},    {"1/7000", 1.0L / 7000, "0.0001"}, {"-5e-1/2", -0.25L, "-1/4"}};
  for (const Case& c : cases) {
    SCOPED_TRACE(c.typed);
    EXPECT_TRUE(edit.model()->setData(cell, c.typed));
    EXPECT_EQ(edit.Matrix()[0][0], c.value);
    EXPECT_EQ(cell.data().toString(), c.shown);
  }
  // A value shown as rounded decimals opens its editor on every digit.
  ASSERT_TRUE(edit.model()->setData(cell, "1/7000"));
  EXPECT_EQ(Str2Float(cell.data(Qt::EditRole).toString().toStdString()), 1.0L / 7000);
  for (const char* bad : {"1/0", "2//3", "a/3", "1/2/3", "/3"}) {
    SCOPED_TRACE(bad);
    EXPECT_FALSE(edit.model()->setData(cell, bad));
    EXPECT_EQ(errors.last()[1].toInt(), -1);
  }
  EXPECT_EQ(edit.Matrix()[0][0], 1.0L / 7000);
  edit.SetMaxDenominator(3);
  EXPECT_TRUE(edit.model()->setData(cell, "0.1"));
  EXPECT_EQ(cell.data().toString(), "0.1000");
}

// Known best approximations: 355/113 and 311/99 for pi; the bound is respected.
TEST(BestFraction, FindsTheNearestFractionWithinTheBound) {
  struct Case {
    Extended x;
    Int64 bound, p, q;
  };
  const Case cases[] = {{QENPi, 1000, 355, 113},
                        {QENPi, 100, 311, 99},
                        {QENPi, 7, 22, 7},
                        {-2.5L, 1000, -5, 2},
                        {0.75L, 3, 2, 3},
                        {1e15L, 10, 1000000000000000, 1},
                        {0, 5, 0, 1}};
  for (const Case& c : cases) {
    const auto f = detail::BestFraction(c.x, c.bound);
    ASSERT_TRUE(f.has_value());
    EXPECT_EQ(f->Numerator, c.p);
    EXPECT_EQ(f->Denominator, c.q);
  }
  EXPECT_FALSE(detail::BestFraction(1e300L, 10).has_value());
  EXPECT_FALSE(detail::BestFraction(std::numeric_limits<Extended>::quiet_NaN(), 10).has_value());
}

}  // namespace
}  // namespace tovrin
