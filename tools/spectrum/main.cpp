// Renders the spectral view's background image from the CIE colour-matching functions.
//
//   vexa-spectrum-image FILE.png [--width N] [--height N]
//
// The committed image is vexa/resources/graph/Spectrum.png (tools/spectrum/render.sh).

#include "spectrumimage.h"

#include <QCommandLineParser>
#include <QGuiApplication>

#include <cstdio>

int main(int argc, char **argv)
{
    QGuiApplication app(argc, argv);
    QCommandLineParser parser;
    parser.setApplicationDescription(QStringLiteral("Renders the spectrum background image of the spectral view."));
    parser.addHelpOption();
    QCommandLineOption widthOption(QStringLiteral("width"), QStringLiteral("Image width (one column per nm: 301)."),
                                   QStringLiteral("N"), QString::number(vexa::SpectrumImage::DefaultWidth));
    QCommandLineOption heightOption(QStringLiteral("height"), QStringLiteral("Image height."), QStringLiteral("N"),
                                    QString::number(vexa::SpectrumImage::DefaultHeight));
    parser.addOptions({widthOption, heightOption});
    parser.addPositionalArgument(QStringLiteral("file"), QStringLiteral("The PNG file to write."));
    parser.process(app);
    if (parser.positionalArguments().size() != 1) {
        std::fprintf(stderr, "vexa-spectrum-image: give one output file\n");
        return 2;
    }
    const QString file = parser.positionalArguments().front();
    const QImage image = vexa::SpectrumImage::render(parser.value(widthOption).toInt(), parser.value(heightOption).toInt());
    if (image.isNull()) {
        std::fprintf(stderr, "vexa-spectrum-image: no image (bad size or missing CIE tables)\n");
        return 1;
    }
    if (!image.save(file, "PNG")) {
        std::fprintf(stderr, "vexa-spectrum-image: cannot write %s\n", qPrintable(file));
        return 1;
    }
    std::printf("%s: %dx%d\n", qPrintable(file), image.width(), image.height());
    return 0;
}
