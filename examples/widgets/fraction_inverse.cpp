// Inverts a matrix in a fraction grid and prints what its cells show: 3/5 -1/5 / -1/5 2/5.
#include <tovrin/widgets/TOVRINWidgets.h>
#include <QApplication>
#include <cstdio>

int main(int argc, char** argv) {
  QApplication app(argc, argv);  // QT_QPA_PLATFORM=offscreen runs it without a display
  tovrin::TQENMatrixFractEdit grid;
  grid.SetMatrix({{2, 1}, {1, 3}});
  if (!grid.Inverse()) return 1;  // a failure also emits MathErrorRaised(message, ident)
  for (int r = 0; r < grid.Rows(); ++r)
    for (int c = 0; c < grid.Cols(); ++c)
      std::printf("%s%c", qPrintable(grid.model()->index(r, c).data().toString()),
                  c + 1 < grid.Cols() ? ' ' : '\n');
}
