// screenshot_check FILE.png: succeeds when FILE is an image of at least 300 x 200 pixels
// with more than twenty colours (a window's screenshot rather than a blank one).
#include <QGuiApplication>
#include <QImage>
#include <cstdio>
#include <set>

int main(int argc, char** argv) {
  if (argc != 2) {
    std::fputs("usage: screenshot_check FILE.png\n", stderr);
    return 2;
  }
  const QImage image(QString::fromLocal8Bit(argv[1]));
  std::set<QRgb> colours;
  for (int y = 0; y < image.height(); y += 2)
    for (int x = 0; x < image.width(); x += 2) colours.insert(image.pixel(x, y));
  if (image.width() < 300 || image.height() < 200 || colours.size() <= 20) {
    std::fprintf(stderr, "%s: blank or missing screenshot (%dx%d, %zu colours)\n", argv[1],
                 image.width(), image.height(), colours.size());
    return 1;
  }
  std::printf("%s: %dx%d, %zu colours\n", argv[1], image.width(), image.height(), colours.size());
  return 0;
}
