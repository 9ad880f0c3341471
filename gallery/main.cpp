// The gallery of the touch widgets: every widget in every state, one window per page.
//
//   gallery                      shows all pages
//   gallery PAGE...              shows these pages
//   gallery --shoot DIR          writes a PNG file per page
//   gallery --digest DIR         writes the digests for comparing pictures
//   gallery --monkey SEED COUNT  sends COUNT random inputs to all pages; exit code 1 when a problem is found
#include "app/APPEventFilter.h"
#include "gallery/GalleryPages.h"
#include "gallery/GalleryScreen.h"
#include "gallery/Monkey.h"
#include "gallery/PagePicture.h"

#include <QApplication>
#include <QDir>
#include <QFile>
#include <QStringList>

#include <cstdio>
#include <memory>
#include <vector>

namespace
{

const char USAGE[] = "usage: gallery [--shoot DIR | --digest DIR | --monkey SEED COUNT] [PAGE...]\n";

QList<GalleryPages::Maker> chosen(const QStringList& names)
{
    if (names.isEmpty())
        return GalleryPages::all();
    QList<GalleryPages::Maker> result;
    for (const GalleryPages::Maker& maker : GalleryPages::all())
        if (names.contains(maker().name))
            result.append(maker);
    return result;
}

int shoot(const QDir& folder, bool digests, const QStringList& names)
{
    if (!folder.mkpath(QStringLiteral(".")))
        return 1;
    for (const GalleryPages::Maker& maker : chosen(names)) {
        GalleryPage page = maker();
        const QImage picture = page.shoot();
        if (digests) {
            QFile file(folder.filePath(page.name + QStringLiteral(".txt")));
            if (!file.open(QIODevice::WriteOnly))
                return 1;
            file.write(PagePicture::digest(picture).join(QLatin1Char('\n')).toLatin1() + '\n');
        } else if (!picture.save(folder.filePath(page.name + QStringLiteral(".png")))) {
            return 1;
        }
        page.close();
    }
    return 0;
}

int playMonkey(quint32 seed, int count, const QStringList& names)
{
    APPEventFilter* filter = APPEventFilter::instance();
    const QList<GalleryPages::Maker> pages = chosen(names);
    if (pages.isEmpty())
        return 2;
    int failures = 0;
    for (qsizetype i = 0; i < pages.size(); ++i) {
        // Each page has its own seed, so that it can be tested alone.
        GalleryPage page = pages.at(i)();
        const int steps =
            count / static_cast<int>(pages.size()) + (i < count % static_cast<int>(pages.size()) ? 1 : 0);
        page.show();
        QCoreApplication::processEvents();
        {
            Monkey monkey(filter, seed);
            const QStringList problems = monkey.play(page, steps);
            std::fprintf(stderr, "%s: seed %u, %d steps, input %08x\n", qPrintable(page.name), seed, steps,
                         monkey.inputChecksum());
            for (const QString& problem : problems) {
                ++failures;
                std::fprintf(stderr, "  %s\n", qPrintable(problem));
            }
        }
        filter->unlock();
        page.close();
    }
    return failures == 0 ? 0 : 1;
}

int showPages(const QStringList& names)
{
    APPEventFilter::instance();
    std::vector<GalleryPage> pages;
    for (const GalleryPages::Maker& maker : chosen(names)) {
        pages.push_back(maker());
        pages.back().show();
    }
    return pages.empty() ? 2 : QApplication::exec();
}

} // namespace

int main(int argc, char* argv[])
{
    QStringList arguments;
    for (int i = 1; i < argc; ++i)
        arguments.append(QString::fromLocal8Bit(argv[i]));
    const QString mode = arguments.value(0);
    const bool monkey = mode == QStringLiteral("--monkey");
    const bool digests = mode == QStringLiteral("--digest");
    const bool pictures = digests || mode == QStringLiteral("--shoot");
    const qsizetype options = monkey ? 3 : pictures ? 2 : 0;
    bool validSeed = true;
    bool validCount = true;
    const quint32 seed = monkey ? arguments.value(1).toUInt(&validSeed) : 0;
    const int count = monkey ? arguments.value(2).toInt(&validCount) : 0;
    if (arguments.size() < options || !validSeed || !validCount || count < 0 ||
        (options == 0 && mode.startsWith(QLatin1Char('-')))) {
        std::fputs(USAGE, stderr);
        return 2;
    }
    const QStringList names = arguments.mid(options);
    if (qEnvironmentVariableIsEmpty("FONTCONFIG_FILE"))
        qputenv("FONTCONFIG_FILE", TITLER_FONTS_CONF);
    std::unique_ptr<GalleryScreen> screen;
    if (monkey || pictures)
        screen = std::make_unique<GalleryScreen>();
    QApplication application(argc, argv);
    Q_INIT_RESOURCE(TitlerToolResource);
    Q_INIT_RESOURCE(UILibrary);
    QApplication::setFont(QFont(QStringLiteral("KST"), 12));
    if (monkey)
        return playMonkey(seed, count, names);
    return pictures ? shoot(QDir(arguments.at(1)), digests, names) : showPages(names);
}
