#include "bench/BenchTitles.h"

#include "document/ArchiveOrder.h"
#include "document/TitleParser.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QRandomGenerator>
#include <QString>
#include <array>
#include <cmath>
#include <functional>

namespace
{

constexpr int CHARACTERS_A_WORD = 6;
constexpr int CHARACTERS_A_LINE = 40;
constexpr int FIRST_NUMBER = 100;    // the first number with three digits
constexpr std::size_t EXTENSION = 4; // length of ".xml"
constexpr QSize SMALL_PICTURE(240, 135);
constexpr int FOLDER_TITLE_CHARACTERS = 40;
constexpr int DIFFERENT_TITLES = 200; // in a folder; more have the texts of these
constexpr std::array COLORS = {"#FFFFFF", "#FFD24D", "#8FE3FF", "#FF6060"};
constexpr std::u16string_view LETTERS = u"Breaking news from the coast 快讯速報 live at ten o'clock ";

std::string nameOf(int number)
{
    return "20240101090000" + std::to_string(FIRST_NUMBER + number) + ".xml";
}

// Writes a title with the texts of another one, which takes a small part of the time of making it.
void copyTitle(const std::string& folder, const std::string& from, const std::string& to)
{
    QFile source(QString::fromStdString(folder + '/' + from));
    QFile target(QString::fromStdString(folder + '/' + to));
    if (!source.open(QIODevice::ReadOnly) || !target.open(QIODevice::WriteOnly))
        return;
    const auto stem = [](const std::string& name) {
        return QByteArray::fromStdString(name.substr(0, name.size() - EXTENSION));
    };
    target.write(source.readAll().replace(stem(from), stem(to)));
}

TextStyle styleOf(int position, const BenchTitles::Look& look)
{
    const int word = look.mixed ? position / CHARACTERS_A_WORD : 0;
    TextStyle style;
    style.setFontFamily("KST");
    style.setAlphaDefaultFontOfInputLanguage("KST");
    style.setFontSize(look.size + word % 3 * 4);
    style.setFontColor(COLORS[static_cast<std::size_t>(word) % COLORS.size()]);
    style.setFontBold(word % 5 == 1);
    style.setIsTextItalic(word % 7 == 2);
    if (look.edgeWidth > 0) {
        TEdge edge;
        edge.setEdgeWidth(look.edgeWidth);
        edge.setEdgeColor("#102040");
        style.setTextEdge(edge);
        style.setIsTextEdge(1);
    }
    return style;
}

} // namespace

std::unique_ptr<TText> BenchTitles::text(int id, float x, float y, const Look& look)
{
    auto text = std::make_unique<TText>();
    text->setTextObjectID(id);
    text->setXValue(x);
    text->setYValue(y);
    text->setZValue(static_cast<float>(id));
    text->setTextAlign(-1);
    text->setShadowStyle(look.shadow ? 1 : 0);
    if (look.shadow) {
        TShadow shadow;
        shadow.setShadowDirectionX(1);
        shadow.setShadowDirectionY(1);
        text->setTextShadow(shadow);
    }
    std::string whole;
    std::vector<TextStyle*> items;
    int letter = look.firstLetter;
    const auto add = [&](const QString& c) {
        auto style = std::make_unique<TextStyle>(styleOf(static_cast<int>(items.size()), look));
        style->setText(c.toStdString());
        whole += style->getText();
        items.push_back(style.release());
    };
    for (int i = 0; i < look.characters; ++i) {
        if (i > 0 && i % CHARACTERS_A_LINE == 0)
            add(QStringLiteral("\n"));
        add(QString(QChar(LETTERS[static_cast<std::size_t>(letter++) % LETTERS.size()])));
    }
    text->setText(whole);
    text->setTextItems(std::move(items));
    return text;
}

Archive BenchTitles::title(const std::string& path, int characters, int size, int textCount)
{
    Archive archive;
    const std::size_t slash = path.rfind('/');
    const std::string stem = path.substr(slash + 1, path.size() - slash - 5);
    archive.setPath(path);
    archive.setName(stem);
    archive.setVersion("1.0");
    archive.setThumbnailBig(stem + "_1920.png");
    archive.setThumbnailMiddle(stem + "_960.png");
    archive.setThumbnailSmall(stem + "_240.png");
    archive.setThumbnailBlack(stem + "_240S.png");
    constexpr float LINE = 170;
    std::vector<TText*> texts;
    for (int id = 1; id <= textCount; ++id) {
        const Look look{characters, size, id == 1 ? 4 : 0,
                        id == 2,    true, static_cast<int>(std::hash<std::string>()(stem) % LETTERS.size())};
        texts.push_back(text(id, 20, 10 + LINE * static_cast<float>(id - 1), look).release());
    }
    archive.setText(std::move(texts));
    return archive;
}

std::vector<std::string> BenchTitles::writeFolder(const std::string& folder, int count, int texts)
{
    TitleParser parser;
    std::vector<std::string> paths;
    std::vector<ArchiveOrder> rows;
    for (int i = 0; i < count; ++i) {
        const std::string name = nameOf(i);
        const std::string path = folder + '/' + name;
        if (i < DIFFERENT_TITLES) {
            Archive archive = title(path, FOLDER_TITLE_CHARACTERS, 48, texts);
            parser.writeOneTitle(&archive);
        } else {
            copyTitle(folder, nameOf(i % DIFFERENT_TITLES), name);
        }
        ArchiveOrder row;
        row.setArchiveIndex(i);
        row.setArchivePath(name);
        rows.push_back(row);
        paths.push_back(path);
    }
    parser.writeFileOrderInFolder(folder, rows);
    return paths;
}

std::vector<std::string> BenchTitles::writeIllustratedFolder(const std::string& folder, int count, int texts)
{
    std::vector<std::string> paths = writeFolder(folder, count, texts);
    const auto pictureOf = [](const std::string& path) {
        return QString::fromStdString(path.substr(0, path.size() - EXTENSION) + "_240.png");
    };
    if (paths.empty())
        return paths;
    const QString first = pictureOf(paths.front());
    photograph(SMALL_PICTURE).save(first);
    for (std::size_t i = 1; i < paths.size(); ++i)
        QFile::copy(first, pictureOf(paths[i]));
    return paths;
}

void BenchTitles::illustrate(Archive& title, const QImage& background)
{
    constexpr QSize CANVAS(1280, 720);
    const QString stem =
        QString::fromStdString(title.getPath().substr(0, title.getPath().size() - EXTENSION));
    const auto savePicture = [&](const char* suffix, QSize size) {
        const QString path = stem + QLatin1String(suffix);
        background.copy(QRect(QPoint(), size)).save(path);
        return QFileInfo(path).fileName().toStdString();
    };
    title.setBgResource(savePicture("_source_1280.png", CANVAS));
    title.setBgResourceBig(savePicture("_source_1920.png", background.size()));
    savePicture("_1920.png", background.size());
    savePicture("_960.png", background.size() / 2);
    savePicture("_240.png", SMALL_PICTURE);
    savePicture("_240S.png", SMALL_PICTURE);
}

void BenchTitles::writeChecker()
{
    const QString folder =
        qEnvironmentVariable("K2SYS_AC_DATA") + QStringLiteral("/defaultuser/resources/Templates");
    QDir().mkpath(folder);
    QImage checker(SMALL_PICTURE, QImage::Format_RGB32);
    checker.fill(Qt::gray);
    checker.save(folder + QStringLiteral("/checker_240x135.png"));
}

QImage BenchTitles::photograph(QSize size)
{
    constexpr double WAVE = 90;
    constexpr int GRAIN = 12;
    QRandomGenerator random(1);
    QImage image(size, QImage::Format_RGB32);
    for (int y = 0; y < size.height(); ++y) {
        auto* line = reinterpret_cast<QRgb*>(image.scanLine(y));
        for (int x = 0; x < size.width(); ++x) {
            const double light = 120 + 80 * std::sin(x / WAVE) * std::cos(y / WAVE);
            const int grain = static_cast<int>(random.bounded(GRAIN));
            const int level = static_cast<int>(light) + grain;
            line[x] = qRgb(level, qMin(255, level + y * 40 / size.height()), qMax(0, level - grain * 2));
        }
    }
    return image;
}
