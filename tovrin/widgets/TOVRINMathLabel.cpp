#include "tovrin/widgets/TOVRINMathLabel.h"

#include <QEvent>
#include <QFontMetricsF>
#include <QPainter>
#include <QPainterPath>
#include <algorithm>
#include <cmath>
#include <optional>
#include <vector>

namespace tovrin {
namespace detail {

namespace {

// --- The parsed markup ------------------------------------------------------------------------

struct MathNode {
  enum Kind { Text, Row, Scripts, Fraction, Root } kind = Row;
  QString text;                    // Text
  std::vector<MathNode> children;  // Row: items; Scripts: base, sup, sub; Fraction: num, den;
                                   // Root: radicand
  bool hasSup = false, hasSub = false;
};

struct NamedSymbol {
  const char* name;
  char16_t symbol;
};

constexpr NamedSymbol kSymbols[] = {
    {"alpha", u'\u03B1'},   {"beta", u'\u03B2'},  {"gamma", u'\u03B3'},   {"delta", u'\u03B4'},
    {"epsilon", u'\u03B5'}, {"zeta", u'\u03B6'},  {"eta", u'\u03B7'},     {"theta", u'\u03B8'},
    {"iota", u'\u03B9'},    {"kappa", u'\u03BA'}, {"lambda", u'\u03BB'},  {"mu", u'\u03BC'},
    {"nu", u'\u03BD'},      {"xi", u'\u03BE'},    {"omicron", u'\u03BF'}, {"pi", u'\u03C0'},
    {"rho", u'\u03C1'},     {"sigma", u'\u03C3'}, {"tau", u'\u03C4'},     {"upsilon", u'\u03C5'},
    {"phi", u'\u03C6'},     {"chi", u'\u03C7'},   {"psi", u'\u03C8'},     {"omega", u'\u03C9'},
    {"Gamma", u'\u0393'},   {"Delta", u'\u0394'}, {"Theta", u'\u0398'},   {"Lambda", u'\u039B'},
    {"Xi", u'\u039E'},      {"Pi", u'\u03A0'},    {"Sigma", u'\u03A3'},   {"Upsilon", u'\u03A5'},
    {"Phi", u'\u03A6'},     {"Psi", u'\u03A8'},   {"Omega", u'\u03A9'},   {"sum", u'\u2211'},
    {"int", u'\u222B'},     {"infty", u'\u221E'}, {"pm", u'\u00B1'},      {"times", u'\u00D7'},
    {"cdot", u'\u22C5'},    {"le", u'\u2264'},    {"leq", u'\u2264'},     {"ge", u'\u2265'},
    {"geq", u'\u2265'},     {"ne", u'\u2260'},    {"neq", u'\u2260'},     {"approx", u'\u2248'},
};

// Recursive descent over the markup; every Parse... returns false on malformed input and
// the caller then shows the text literally.
class MarkupParser {
 public:
  explicit MarkupParser(const QString& text) : s_(text) {}

  std::optional<MathNode> Parse() {
    MathNode row;
    if (!ParseRow(row, false)) return std::nullopt;
    return row;
  }

 private:
  // Deeper nesting than this is refused rather than risk the stack.
  static constexpr int kMaxDepth = 40;

  bool AtEnd() const { return pos_ >= s_.size(); }
  QChar Peek() const { return s_[pos_]; }

  bool ParseRow(MathNode& row, bool braced) {
    if (++depth_ > kMaxDepth) return false;
    row.kind = MathNode::Row;
    while (true) {
      if (AtEnd()) {
        --depth_;
        return !braced;
      }
      if (Peek() == u'}') {
        ++pos_;
        --depth_;
        return braced;
      }
      MathNode item;
      if (Peek() == u'^' || Peek() == u'_') {
        item.kind = MathNode::Text;  // a script with nothing before it has an empty base
      } else if (!ParseAtom(item)) {
        return false;
      }
      if (!AtEnd() && (Peek() == u'^' || Peek() == u'_')) {
        MathNode scripts;
        scripts.kind = MathNode::Scripts;
        scripts.children.resize(3);
        scripts.children[0] = std::move(item);
        while (!AtEnd() && (Peek() == u'^' || Peek() == u'_')) {
          const bool sup = Peek() == u'^';
          bool& has = sup ? scripts.hasSup : scripts.hasSub;
          ++pos_;
          if (has || !ParseArgument(scripts.children[sup ? 1 : 2])) return false;
          has = true;
        }
        item = std::move(scripts);
      }
      // Neighbouring plain text is drawn as one run, so the font's kerning applies.
      if (item.kind == MathNode::Text && !row.children.empty() &&
          row.children.back().kind == MathNode::Text) {
        row.children.back().text += item.text;
      } else {
        row.children.push_back(std::move(item));
      }
    }
  }

  // A braced group, or one character or command.
  bool ParseArgument(MathNode& out) {
    if (AtEnd()) return false;
    if (Peek() == u'{') {
      ++pos_;
      return ParseRow(out, true);
    }
    if (Peek() == u'}' || Peek() == u'^' || Peek() == u'_') return false;
    return ParseAtom(out);
  }

  bool ParseAtom(MathNode& out) {
    const QChar c = Peek();
    if (c == u'{') {
      ++pos_;
      return ParseRow(out, true);
    }
    if (c != u'\\') {
      out.kind = MathNode::Text;
      out.text = c;
      ++pos_;
      return true;
    }
    ++pos_;
    if (AtEnd()) return false;
    if (!Peek().isLetter()) {
      const QChar escaped = Peek();
      if (escaped != u'{' && escaped != u'}' && escaped != u'\\' && escaped != u'^' &&
          escaped != u'_')
        return false;
      out.kind = MathNode::Text;
      out.text = escaped;
      ++pos_;
      return true;
    }
    const qsizetype start = pos_;
    while (!AtEnd() && Peek().isLetter()) ++pos_;
    const QString name = s_.mid(start, pos_ - start);
    if (name == u"frac") {
      out.kind = MathNode::Fraction;
      out.children.resize(2);
      return ParseArgument(out.children[0]) && ParseArgument(out.children[1]);
    }
    if (name == u"sqrt") {
      out.kind = MathNode::Root;
      out.children.resize(1);
      return ParseArgument(out.children[0]);
    }
    for (const NamedSymbol& entry : kSymbols) {
      if (name == QLatin1String(entry.name)) {
        out.kind = MathNode::Text;
        out.text = QChar(entry.symbol);
        return true;
      }
    }
    return false;
  }

  const QString& s_;
  qsizetype pos_ = 0;
  int depth_ = 0;
};

// --- Layout -------------------------------------------------------------------------------------

// What is drawn: a text run at a script level, or a stroked line through points. Positions
// are relative to the left end of the baseline.
struct Stroke {
  QString text;  // empty for a line
  int level = 0;
  QPointF at;
  std::vector<QPointF> points;
};

struct Laid {
  qreal width = 0, ascent = 0, descent = 0;
  std::vector<Stroke> strokes;

  void Append(const Laid& other, QPointF offset) {
    for (Stroke s : other.strokes) {
      s.at += offset;
      for (QPointF& p : s.points) p += offset;
      strokes.push_back(std::move(s));
    }
  }
};

}  // namespace

// The laid-out markup of one label, for one font.
struct MathLayout {
  QFont base;
  bool markup = true;
  Laid laid;

  QFont FontAt(int level) const {
    QFont f = base;
    const qreal scale = level == 0 ? 1.0 : level == 1 ? 0.7 : 0.5;
    if (base.pointSizeF() > 0) {
      f.setPointSizeF(base.pointSizeF() * scale);
    } else {
      f.setPixelSize(std::max(1, static_cast<int>(std::lround(base.pixelSize() * scale))));
    }
    return f;
  }

  qreal RuleWidth(int level) const {
    return std::max<qreal>(1.0, QFontMetricsF(FontAt(level)).lineWidth());
  }

  Laid Lay(const MathNode& node, int level) const {
    const QFontMetricsF fm(FontAt(level));
    Laid out;
    switch (node.kind) {
      case MathNode::Text:
        out.width = fm.horizontalAdvance(node.text);
        out.ascent = fm.ascent();
        out.descent = fm.descent();
        if (!node.text.isEmpty()) out.strokes.push_back({node.text, level, {0, 0}, {}});
        break;
      case MathNode::Row:
        out.ascent = fm.ascent();
        out.descent = fm.descent();
        for (const MathNode& child : node.children) {
          const Laid c = Lay(child, level);
          out.Append(c, {out.width, 0});
          out.width += c.width;
          out.ascent = std::max(out.ascent, c.ascent);
          out.descent = std::max(out.descent, c.descent);
        }
        break;
      case MathNode::Scripts: {
        const Laid base = Lay(node.children[0], level);
        out = base;
        const qreal gap = 0.05 * fm.height();
        qreal scriptWidth = 0;
        if (node.hasSup) {
          const Laid sup = Lay(node.children[1], level + 1);
          const qreal raise = std::max(0.42 * fm.ascent(), base.ascent - 0.55 * sup.ascent);
          out.Append(sup, {base.width + gap, -raise});
          out.ascent = std::max(out.ascent, raise + sup.ascent);
          scriptWidth = std::max(scriptWidth, sup.width);
        }
        if (node.hasSub) {
          const Laid sub = Lay(node.children[2], level + 1);
          const qreal drop = std::max(
              0.2 * fm.ascent(), base.descent + 0.2 * sub.ascent - (node.hasSup ? 0 : sub.descent));
          out.Append(sub, {base.width + gap, drop});
          out.descent = std::max(out.descent, drop + sub.descent);
          scriptWidth = std::max(scriptWidth, sub.width);
        }
        out.width = base.width + gap + scriptWidth;
        break;
      }
      case MathNode::Fraction: {
        const Laid num = Lay(node.children[0], level);
        const Laid den = Lay(node.children[1], level);
        const qreal axis = fm.strikeOutPos();
        const qreal rule = RuleWidth(level);
        const qreal gap = std::max(rule, 0.12 * fm.xHeight());
        const qreal pad = 0.15 * fm.averageCharWidth();
        out.width = std::max(num.width, den.width) + 2 * pad;
        const qreal numBaseline = -(axis + rule / 2 + gap + num.descent);
        const qreal denBaseline = -axis + rule / 2 + gap + den.ascent;
        out.Append(num, {(out.width - num.width) / 2, numBaseline});
        out.Append(den, {(out.width - den.width) / 2, denBaseline});
        out.strokes.push_back(
            {QString(), level, {}, {{pad / 2, -axis}, {out.width - pad / 2, -axis}}});
        out.ascent = -numBaseline + num.ascent;
        out.descent = std::max(fm.descent(), denBaseline + den.descent);
        break;
      }
      case MathNode::Root: {
        const Laid body = Lay(node.children[0], level);
        const qreal rule = RuleWidth(level);
        const qreal gap = std::max(rule, 0.12 * fm.xHeight());
        const qreal sign = 0.55 * fm.averageCharWidth() + 0.1 * (body.ascent + body.descent);
        const qreal pad = 0.15 * fm.averageCharWidth();
        const qreal top = -(body.ascent + gap + rule / 2);
        const qreal bottom = body.descent;
        const qreal mid = bottom - 0.45 * (bottom - top);
        out.width = sign + body.width + 2 * pad;
        out.Append(body, {sign + pad, 0});
        out.strokes.push_back({QString(),
                               level,
                               {},
                               {{0, mid},
                                {0.25 * sign, mid - 0.1 * sign},
                                {0.55 * sign, bottom},
                                {sign, top},
                                {out.width, top}}});
        out.ascent = body.ascent + gap + rule;
        out.descent = body.descent;
        break;
      }
    }
    return out;
  }

  MathLayout(const QString& text, const QFont& font) : base(font) {
    std::optional<MathNode> tree;
    tree = MarkupParser(text).Parse();
    if (!tree) {
      markup = false;
      MathNode literal;
      literal.kind = MathNode::Text;
      literal.text = text;
      tree = std::move(literal);
    }
    laid = Lay(*tree, 0);
  }
};

}  // namespace detail

TQENMathLabel::TQENMathLabel(QWidget* parent) : TQENMathLabel(QString(), parent) {}

TQENMathLabel::TQENMathLabel(const QString& Text, QWidget* parent) : QWidget(parent), text_(Text) {
  setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Fixed);
  Relayout();
}

TQENMathLabel::~TQENMathLabel() = default;

void TQENMathLabel::SetText(const QString& Text) {
  if (Text == text_) return;
  text_ = Text;
  Relayout();
}

void TQENMathLabel::SetAlignment(Qt::Alignment Value) {
  alignment_ = Value;
  update();
}

bool TQENMathLabel::IsMarkup() const { return layout_->markup; }

int TQENMathLabel::Ascent() const { return static_cast<int>(std::ceil(layout_->laid.ascent)); }

void TQENMathLabel::Relayout() {
  layout_ = std::make_unique<detail::MathLayout>(text_, font());
  setAccessibleName(text_);
  updateGeometry();
  update();
}

QSize TQENMathLabel::sizeHint() const {
  const QMargins m = contentsMargins();
  const auto& laid = layout_->laid;
  return {static_cast<int>(std::ceil(laid.width)) + m.left() + m.right(),
          static_cast<int>(std::ceil(laid.ascent)) + static_cast<int>(std::ceil(laid.descent)) +
              m.top() + m.bottom()};
}

QSize TQENMathLabel::minimumSizeHint() const { return sizeHint(); }

void TQENMathLabel::changeEvent(QEvent* event) {
  if (event->type() == QEvent::FontChange) Relayout();
  QWidget::changeEvent(event);
}

void TQENMathLabel::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  const auto& laid = layout_->laid;
  const QRect area = contentsRect();
  const qreal height = std::ceil(laid.ascent) + std::ceil(laid.descent);
  const qreal width = std::ceil(laid.width);
  const qreal x = alignment_ & Qt::AlignRight     ? area.right() + 1 - width
                  : alignment_ & Qt::AlignHCenter ? area.left() + (area.width() - width) / 2
                                                  : area.left();
  const qreal top = alignment_ & Qt::AlignTop      ? area.top()
                    : alignment_ & Qt::AlignBottom ? area.bottom() + 1 - height
                                                   : area.top() + (area.height() - height) / 2;
  const QPointF origin(std::max<qreal>(area.left(), x),
                       std::max<qreal>(area.top(), top) + std::ceil(laid.ascent));
  const QColor ink = palette().color(foregroundRole());
  for (const auto& stroke : laid.strokes) {
    if (!stroke.text.isEmpty()) {
      painter.setFont(layout_->FontAt(stroke.level));
      painter.setPen(ink);
      painter.drawText(origin + stroke.at, stroke.text);
    } else {
      painter.setPen(
          QPen(ink, layout_->RuleWidth(stroke.level), Qt::SolidLine, Qt::FlatCap, Qt::MiterJoin));
      QPainterPath path(origin + stroke.points.front());
      for (std::size_t i = 1; i < stroke.points.size(); ++i) path.lineTo(origin + stroke.points[i]);
      painter.drawPath(path);
    }
  }
}

}  // namespace tovrin
