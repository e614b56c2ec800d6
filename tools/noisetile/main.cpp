// Writes the theme's pattern tile: a small, seamless, blue-noise-like grey texture that
// glass and background effects sample to break up banding.
//
// Usage: pelkan-noisetile <output.png> [size]

#include <QCoreApplication>
#include <QImage>
#include <QRandomGenerator>
#include <QTextStream>

#include <cmath>

int main(int argc, char **argv)
{
    QCoreApplication app(argc, argv);
    const QStringList args = app.arguments();
    if (args.size() < 2) {
        QTextStream(stderr) << "usage: pelkan-noisetile <output.png> [size]\n";
        return 2;
    }
    const int size = args.size() > 2 ? args.at(2).toInt() : 64;
    if (size < 4 || size > 1024) {
        QTextStream(stderr) << "size must be between 4 and 1024\n";
        return 2;
    }

    // White noise, then a 3x3 high-pass on the torus: the low frequencies that show up as
    // blotches are removed and the tile wraps without a seam. A fixed seed keeps the file
    // identical from build to build.
    QRandomGenerator random(0x5eed);
    std::vector<double> noise(size * size);
    for (double &value : noise)
        value = random.generateDouble();

    auto at = [&](int x, int y) { return noise[((y + size) % size) * size + (x + size) % size]; };
    std::vector<double> filtered(size * size);
    double lo = 1e9, hi = -1e9;
    for (int y = 0; y < size; ++y) {
        for (int x = 0; x < size; ++x) {
            double blur = 0;
            for (int dy = -1; dy <= 1; ++dy)
                for (int dx = -1; dx <= 1; ++dx)
                    blur += at(x + dx, y + dy);
            const double value = at(x, y) - blur / 9.0;
            filtered[y * size + x] = value;
            lo = std::min(lo, value);
            hi = std::max(hi, value);
        }
    }

    QImage image(size, size, QImage::Format_Grayscale8);
    for (int y = 0; y < size; ++y) {
        uchar *line = image.scanLine(y);
        for (int x = 0; x < size; ++x)
            line[x] = uchar(std::lround(255.0 * (filtered[y * size + x] - lo) / (hi - lo)));
    }
    image.setText(QStringLiteral("Grayscale"), QStringLiteral("true"));
    if (!image.save(args.at(1), "PNG")) {
        QTextStream(stderr) << "cannot write " << args.at(1) << "\n";
        return 1;
    }
    return 0;
}
