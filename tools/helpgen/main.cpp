// helpgen: turns one Markdown user guide, with its SVG figures, into a PDF.
#include "GuideStyle.h"
#include "PdfBook.h"
#include "SvgFigures.h"

#include "app/Trace.h"

#include <QCommandLineParser>
#include <QDir>
#include <QElapsedTimer>
#include <QFile>
#include <QFileInfo>
#include <QGuiApplication>
#include <QPageLayout>
#include <QPageSize>
#include <QPdfWriter>
#include <QRawFont>
#include <QSaveFile>
#include <QTextBlock>
#include <QTextDocument>

namespace {

constexpr int Resolution = 600;
const QMarginsF PageMarginsMm(20, 18, 20, 12);

int fail(const QString &message)
{
    QFile err;
    err.open(stderr, QIODevice::WriteOnly);
    err.write(("helpgen: " + message + "\n").toUtf8());
    return 1;
}

// Qt would quietly borrow missing glyphs from any other font, or draw boxes; a guide in
// a script the chosen font lacks is a missing font package, and says so.
bool fontCoversText(const QFont &font, const QString &text, QString *error)
{
    const QRawFont raw = QRawFont::fromFont(font);
    for (const uint ucs4 : text.toUcs4()) {
        if (ucs4 < 0x20 || QChar::isSpace(ucs4))
            continue;
        if (!raw.supportsCharacter(ucs4)) {
            *error = QStringLiteral("font '%1' has no glyph for U+%2; install a font family that covers "
                                    "the guide's script and pass it with --font")
                         .arg(raw.familyName())
                         .arg(ucs4, 4, 16, QLatin1Char('0'));
            return false;
        }
    }
    return true;
}

} // namespace

int main(int argc, char *argv[])
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    // Trace lines and Qt's own start-up notes are diagnostics: off unless asked for.
    if (qEnvironmentVariableIsEmpty("TOURLET_HELPGEN_TRACE"))
        qInstallMessageHandler([](QtMsgType, const QMessageLogContext &, const QString &) {});
    QGuiApplication app(argc, argv);
    QCoreApplication::setApplicationName(QStringLiteral("helpgen"));

    QCommandLineParser parser;
    parser.setApplicationDescription(QStringLiteral("Writes a Markdown user guide with SVG figures as an A4 PDF."));
    parser.addHelpOption();
    parser.addPositionalArgument(QStringLiteral("guide"), QStringLiteral("the Markdown file"));
    const QCommandLineOption output({QStringLiteral("o"), QStringLiteral("output")},
                                    QStringLiteral("PDF file to write"), QStringLiteral("file"));
    const QCommandLineOption figures(QStringLiteral("figures"),
                                     QStringLiteral("folder of the figures the guide names (default: its own folder)"),
                                     QStringLiteral("folder"));
    const QCommandLineOption font(QStringLiteral("font"), QStringLiteral("font family of the text"),
                                  QStringLiteral("family"), QStringLiteral("DejaVu Sans"));
    const QCommandLineOption version(QStringLiteral("program-version"),
                                     QStringLiteral("version for @VERSION@ and the footer"),
                                     QStringLiteral("text"), QStringLiteral(TOURLET_VERSION));
    parser.addOptions({output, figures, font, version});
    parser.process(app);

    if (parser.positionalArguments().size() != 1 || !parser.isSet(output))
        return fail(QStringLiteral("usage: helpgen GUIDE.md -o OUTPUT.pdf [--figures DIR] [--font FAMILY]"));

    QElapsedTimer clock;
    clock.start();
    const QString guidePath = parser.positionalArguments().constFirst();
    QFile guide(guidePath);
    if (!guide.open(QIODevice::ReadOnly))
        return fail(QStringLiteral("can't read %1: %2").arg(guidePath, guide.errorString()));
    const QString programVersion = parser.value(version);
    const QString markdown = QString::fromUtf8(guide.readAll()).replace(QLatin1String("@VERSION@"), programVersion);

    QFont bodyFont(parser.value(font));
    bodyFont.setPointSizeF(10.0);
    QString error;
    if (!fontCoversText(bodyFont, markdown, &error))
        return fail(QStringLiteral("%1: %2").arg(guidePath, error));

    const QString outputPath = parser.value(output);
    QDir().mkpath(QFileInfo(outputPath).absolutePath());
    QSaveFile file(outputPath);
    if (!file.open(QIODevice::WriteOnly))
        return fail(QStringLiteral("can't write %1: %2").arg(outputPath, file.errorString()));
    QPdfWriter writer(&file);
    writer.setResolution(Resolution);
    writer.setPageLayout(QPageLayout(QPageSize(QPageSize::A4), QPageLayout::Portrait, PageMarginsMm,
                                     QPageLayout::Millimeter));
    writer.setCreator(QStringLiteral("Tourlet %1").arg(programVersion));
    PdfBook book(writer, QStringLiteral("Tourlet %1").arg(programVersion));

    QTextDocument document;
    document.setMarkdown(markdown, QTextDocument::MarkdownDialectGitHub);
    GuideStyle(bodyFont).apply(document);
    const QString figureFolder =
        parser.isSet(figures) ? parser.value(figures) : QFileInfo(guidePath).absolutePath();
    SvgFigures svg(figureFolder, book.bodyWidth());
    if (!svg.attach(document, &error))
        return fail(QStringLiteral("%1: %2").arg(guidePath, error));

    writer.setTitle(document.begin().text());
    book.paginate(document);
    const int pages = book.print(document);
    if (pages == 0 || !file.commit())
        return fail(QStringLiteral("writing %1 failed").arg(outputPath));

    logTrace(0, QStringLiteral("helpgen: %s, %d pages in %d ms"), outputPath, pages, int(clock.elapsed()));
    return 0;
}
