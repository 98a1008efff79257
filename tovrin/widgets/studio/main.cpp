// tovrin-studio: try the tovrin widgets. With --screenshot FILE the window is rendered
// offscreen to a PNG and the program exits.
#include <QApplication>
#include <QPixmap>
#include <cstdio>
#include <cstring>

#include "tovrin/widgets/studio/StudioWindow.h"

int main(int argc, char** argv) {
  const char* screenshot = nullptr;
  for (int i = 1; i < argc; ++i) {
    if (std::strcmp(argv[i], "--screenshot") == 0 && i + 1 < argc) {
      screenshot = argv[++i];
    } else if (std::strcmp(argv[i], "--help") == 0 || std::strcmp(argv[i], "-h") == 0) {
      std::puts("usage: tovrin-studio [--screenshot FILE.png]");
      return 0;
    } else if (std::strcmp(argv[i], "--screenshot") == 0) {
      std::fputs("tovrin-studio: --screenshot needs a file name\n", stderr);
      return 2;
    }
  }
  // A screenshot needs no display.
  if (screenshot != nullptr && qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
    qputenv("QT_QPA_PLATFORM", "offscreen");
  QApplication app(argc, argv);
  tovrin::StudioWindow window;
  if (screenshot == nullptr) {
    window.show();
    return QApplication::exec();
  }
  window.resize(window.sizeHint().expandedTo(QSize(820, 600)));
  window.show();
  QApplication::processEvents();
  if (!window.grab().save(QString::fromLocal8Bit(screenshot), "PNG")) {
    std::fprintf(stderr, "tovrin-studio: cannot write %s\n", screenshot);
    return 1;
  }
  return 0;
}
