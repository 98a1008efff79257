#include "tovrin/widgets/TOVRINMathLabel.h"

#include <gtest/gtest.h>

#include <QDir>
#include <QImage>
#include <QProcess>
#include <QTemporaryDir>
#include <cmath>
#include <set>

namespace tovrin {
namespace {

QSize HintOf(const QString& text) { return TQENMathLabel(text).sizeHint(); }
int AscentOf(const QString& text) { return TQENMathLabel(text).Ascent(); }

TEST(MathLabelLayout, FractionsRootsAndScriptsChangeTheLineAsTheyShould) {
  const QSize line = HintOf("a");
  EXPECT_GT(HintOf("\\frac{a}{b}").height(), line.height());
  EXPECT_GT(HintOf("\\sqrt{a}").width(), line.width());
  EXPECT_GT(AscentOf("x^2"), AscentOf("x"));                // a superscript raises the top
  EXPECT_EQ(AscentOf("x_i"), AscentOf("x"));                // a subscript does not
  EXPECT_GT(HintOf("x_i").height(), HintOf("x").height());  // it lowers the bottom
  EXPECT_GT(AscentOf("e^{x^2}"), AscentOf("e^x"));
  // A script is smaller than its base.
  EXPECT_LT(HintOf("x^{abc}").width(), HintOf("xabc").width());
}

TEST(MathLabelLayout, SymbolsAreDrawnAsTheirCharacters) {
  const QFontMetricsF fm(TQENMathLabel().font());
  EXPECT_EQ(HintOf("\\alpha").width(), std::ceil(fm.horizontalAdvance(QChar(0x03B1))));
  EXPECT_EQ(HintOf("a \\le b").width(),
            std::ceil(fm.horizontalAdvance(QString("a ") + QChar(0x2264) + " b")));
}

// Malformed markup is laid out as the literal text, and drawing it does not throw.
TEST(MathLabelLayout, MalformedMarkupIsShownLiterally) {
  const QString deep = QString(200, '{') + "x" + QString(200, '}');
  for (const QString& bad :
       {QString("\\frac{a}{b"), QString("x^"), QString("\\foo"), QString("a}"), QString("{a"),
        QString("a^2^3"), QString("\\"), QString("\\frac{a}"), deep}) {
    SCOPED_TRACE(bad.left(20).toStdString());
    TQENMathLabel label(bad);
    EXPECT_FALSE(label.IsMarkup());
    const QFontMetricsF fm(label.font());
    EXPECT_EQ(label.sizeHint().width(), std::ceil(fm.horizontalAdvance(bad)));
    EXPECT_FALSE(label.grab().isNull());
  }
  for (const QString& good : {QString("x^{n+1} + a_{ij}"), QString("\\sum_{i=1}^n x_i^2"),
                              QString("\\int \\sqrt{\\frac{\\pi}{2}} \\approx \\infty"),
                              QString("\\{a\\} \\pm \\Gamma \\Omega"), QString("")}) {
    EXPECT_TRUE(TQENMathLabel(good).IsMarkup()) << good.toStdString();
  }
}

TEST(MathLabelLayout, FollowsTheWidgetsFont) {
  TQENMathLabel label("\\frac{1}{2}");
  const QSize before = label.sizeHint();
  QFont big = label.font();
  big.setPointSizeF(big.pointSizeF() * 2);
  label.setFont(big);
  EXPECT_GT(label.sizeHint().height(), before.height() * 3 / 2);
}

// The installed program's screenshot: written, of window size, and not one flat colour.
TEST(StudioScreenshot, IsWrittenAndIsNotBlank) {
  QTemporaryDir dir;
  ASSERT_TRUE(dir.isValid());
  const QString file = dir.filePath("studio.png");
  QProcess studio;
  studio.start(TOVRIN_STUDIO_PROGRAM, {"--screenshot", file});
  ASSERT_TRUE(studio.waitForFinished(60000));
  EXPECT_EQ(studio.exitCode(), 0) << studio.readAllStandardError().toStdString();
  const QImage image(file);
  ASSERT_FALSE(image.isNull());
  EXPECT_GT(image.width(), 300);
  EXPECT_GT(image.height(), 200);
  std::set<QRgb> colours;
  for (int y = 0; y < image.height(); y += 3)
    for (int x = 0; x < image.width(); x += 3) colours.insert(image.pixel(x, y));
  EXPECT_GT(colours.size(), 20u);
}

}  // namespace
}  // namespace tovrin
