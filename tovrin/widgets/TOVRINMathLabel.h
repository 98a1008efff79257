// TQENMathLabel: a label that draws mathematical text from a small markup.
//
//   x^2, x^{n+1}     superscripts        a_i, a_{ij}   subscripts (both may follow one base)
//   \frac{a}{b}      a fraction          \sqrt{x}      a square root
//   \alpha ... \omega, \Gamma, \Delta, \Theta, \Lambda, \Xi, \Pi, \Sigma, \Upsilon, \Phi,
//   \Psi, \Omega     Greek letters
//   \sum \int \infty \pm \times \cdot \le \ge \ne \approx    symbols
//   \{ \} \\ \^ \_   the character itself
//
// Everything else is plain text and passes through as typed, spaces included. Scripts are
// drawn smaller and aligned to the base's baseline; a fraction is centred on the font's math
// axis. Malformed markup (an unclosed or unmatched brace, an unknown command, a script or a
// command without its argument, a second superscript on one base) is drawn as the literal
// text; nothing here throws. The layout uses the widget's font; sizeHint() is the laid-out
// size plus the contents margins.
#pragma once

#include <QWidget>
#include <memory>

namespace tovrin {

namespace detail {
struct MathLayout;
}

class TQENMathLabel : public QWidget {
  Q_OBJECT
  Q_PROPERTY(QString Text READ Text WRITE SetText)
  Q_PROPERTY(Qt::Alignment Alignment READ Alignment WRITE SetAlignment)

 public:
  explicit TQENMathLabel(QWidget* parent = nullptr);
  explicit TQENMathLabel(const QString& Text, QWidget* parent = nullptr);
  ~TQENMathLabel() override;

  QString Text() const { return text_; }
  void SetText(const QString& Text);
  // Where the laid-out text sits in the contents rectangle (as QLabel::alignment); default
  // left and vertically centred.
  Qt::Alignment Alignment() const { return alignment_; }
  void SetAlignment(Qt::Alignment Value);
  // False when the text is malformed markup and is drawn literally.
  bool IsMarkup() const;
  // The laid-out height above the baseline (the ascent), in pixels.
  int Ascent() const;

  QSize sizeHint() const override;
  QSize minimumSizeHint() const override;

 protected:
  void paintEvent(QPaintEvent* event) override;
  void changeEvent(QEvent* event) override;

 private:
  void Relayout();

  QString text_;
  Qt::Alignment alignment_ = Qt::AlignLeft | Qt::AlignVCenter;
  std::unique_ptr<detail::MathLayout> layout_;
};

}  // namespace tovrin
