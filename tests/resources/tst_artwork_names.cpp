// Every picture that the sources name is compiled in.
#include "tests/resources/PictureNames.h"

#include <QDir>
#include <QDirIterator>
#include <QFile>
#include <QImage>
#include <QSet>
#include <QTest>

#include <algorithm>

namespace
{

QStringList compiledPictures()
{
    QStringList names;
    QDirIterator files(QStringLiteral(":/"), QDir::Files, QDirIterator::Subdirectories);
    while (files.hasNext()) {
        const QString path = files.next();
        if (!path.contains(QLatin1Char('.'))) // what the libraries bring along has extensions
            names.append(path);
    }
    return names;
}

// Where the sources lie that make up programs.
QStringList sourceFolders()
{
    QStringList folders =
        QDir(QStringLiteral(TITLER_SOURCE_DIR)).entryList(QDir::Dirs | QDir::NoDotAndDotDot);
    folders.removeIf([](const QString& name) {
        return name.startsWith(QLatin1String("build")) || name == QLatin1String("tests") ||
               name == QLatin1String("resources");
    });
    return folders;
}

// Path as named, and the file that names it.
QMultiMap<QString, QString> namedPictures()
{
    QMultiMap<QString, QString> names;
    const QStringList folders = sourceFolders();
    for (const QString& folder : folders) {
        QDirIterator files(QStringLiteral(TITLER_SOURCE_DIR "/") + folder,
                           {QStringLiteral("*.h"), QStringLiteral("*.cpp")}, QDir::Files,
                           QDirIterator::Subdirectories);
        while (files.hasNext()) {
            QFile file(files.next());
            if (!file.open(QIODevice::ReadOnly))
                continue;
            const QStringList literals = PictureNames::literals(QString::fromUtf8(file.readAll()));
            for (const QString& literal : literals) {
                const QStringList paths = PictureNames::paths(literal);
                for (const QString& path : paths)
                    names.insert(path, file.fileName());
            }
        }
    }
    return names;
}

// Paths that widgets take for a whole family, and the members that each family has.
struct Family {
    const char* path;
    QList<const char*> members;
};

const QList<Family> FAMILIES = {
    {":/KSRadioButton",
     {"/Radiobutton_Off_Rest", "/Radiobutton_Off_Pressed", "/Radiobutton_Off_Disabled",
      "/Radiobutton_On_Rest", "/Radiobutton_On_Pressed", "/Radiobutton_On_Disabled"}},
    {":/RadioButton",
     {"/Radiobutton_Off_Rest", "/Radiobutton_Off_Pressed", "/Radiobutton_Off_Disabled",
      "/Radiobutton_On_Rest", "/Radiobutton_On_Pressed", "/Radiobutton_On_Disabled"}},
    {":/TextToolPanel_TextBox/TextBox_Edittable",
     {"_Left", "_Center", "_Right", "_Pulldown", "_Disable_Left", "_Disable_Center", "_Disable_Right",
      "_Disable_Pulldown"}},
};

bool isCompleteFamily(const QString& path, const QStringList& existing)
{
    for (const Family& family : FAMILIES) {
        if (path == QLatin1String(family.path)) {
            return std::all_of(family.members.begin(), family.members.end(), [&](const char* member) {
                return existing.contains(path + QLatin1String(member));
            });
        }
    }
    return false;
}

const char* const ROWS[] = {"Upper", "Middle", "Bottom"};
const char* const COLUMNS[] = {"_Left", "_Center", "_Right"};

} // namespace

class tst_artwork_names : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void namesAreFoundInSource_data();
    void namesAreFoundInSource();
    void commentsAreNoNames();
    void missingNamesAreNoticed();
    void namedPicturesExist();
    void picturesAreReadable();
    void framesAreComplete();
    void sizesAreThoseOfTheWidgets_data();
    void sizesAreThoseOfTheWidgets();
    void canvasFrameSurroundsTheCanvas();
};

void tst_artwork_names::initTestCase()
{
    Q_INIT_RESOURCE(TitlerToolResource);
    Q_INIT_RESOURCE(UILibrary);
}

void tst_artwork_names::namesAreFoundInSource_data()
{
    QTest::addColumn<QString>("source");
    QTest::addColumn<QStringList>("paths");
    QTest::newRow("path") << R"(QImage(":/A/B-1"))" << QStringList{QStringLiteral(":/A/B-1")};
    QTest::newRow("adjacent literals") << "\":/A/\"\n    \"B_C\"" << QStringList{QStringLiteral(":/A/B_C")};
    QTest::newRow("style sheet") << R"(setStyleSheet("background:url(:/A) no-repeat;"))"
                                 << QStringList{QStringLiteral(":/A")};
    QTest::newRow("beginning") << R"(":/A/B_" + name)" << QStringList{QStringLiteral(":/A/B_")};
    QTest::newRow("placeholder") << R"(":/A/B_%1")" << QStringList{QStringLiteral(":/A/B_%1")};
    QTest::newRow("only placeholders") << R"(":/%1/%2")" << QStringList();
    QTest::newRow("slices") << R"("A:B_Left:B_Center" ":B_Right:::")"
                            << QStringList{QStringLiteral(":/A/B_Left"), QStringLiteral(":/A/B_Center"),
                                           QStringLiteral(":/A/B_Right")};
    QTest::newRow("time of day") << R"("hh:mm:ss:zzz")" << QStringList();
    QTest::newRow("quote in a character")
        << R"(c == '"' ? ":/A" : ":/B")" << QStringList{QStringLiteral(":/A"), QStringLiteral(":/B")};
}

void tst_artwork_names::namesAreFoundInSource()
{
    QFETCH(const QString, source);
    QFETCH(const QStringList, paths);
    QStringList found;
    const QStringList literals = PictureNames::literals(source);
    for (const QString& literal : literals)
        found += PictureNames::paths(literal);
    QCOMPARE(found, paths);
}

void tst_artwork_names::commentsAreNoNames()
{
    QVERIFY(PictureNames::literals(QStringLiteral("// \":/A\"\n/* \":/B\"\n \":/C\" */")).isEmpty());
}

void tst_artwork_names::missingNamesAreNoticed()
{
    const QStringList existing{QStringLiteral(":/A/B_Left"), QStringLiteral(":/A/Icon-01")};
    for (const char* path : {":/A/B_Left", ":/A/B_", ":/A/", ":/A/Icon-0%1", ":/A/%1_Left"})
        QVERIFY2(PictureNames::exists(QLatin1String(path), existing), path);
    for (const char* path : {":/A/B_Right", ":/A/B", ":/A/C_", ":/B/", ":/A/Icon-1%1", ":/A/%1_Right"})
        QVERIFY2(!PictureNames::exists(QLatin1String(path), existing), path);
}

void tst_artwork_names::namedPicturesExist()
{
    const QStringList existing = compiledPictures();
    const QMultiMap<QString, QString> names = namedPictures();
    QVERIFY(names.size() > 0);
    QStringList missing;
    for (auto name = names.begin(); name != names.end(); ++name)
        if (!PictureNames::exists(name.key(), existing) && !isCompleteFamily(name.key(), existing))
            missing.append(name.key() + QStringLiteral(" in ") + name.value());
    QVERIFY2(missing.isEmpty(), qPrintable(missing.join(QLatin1Char('\n'))));
}

void tst_artwork_names::picturesAreReadable()
{
    const QStringList existing = compiledPictures();
    QVERIFY(existing.size() > 0);
    for (const QString& name : existing)
        QVERIFY2(!QImage(name).isNull(), qPrintable(name));
}

void tst_artwork_names::framesAreComplete()
{
    for (const char* prefix : {":/PanelBG/Pane_1_", ":/PanelBG/Pane_2_", ":/PanelBG/Dialog_base_",
                               ":/dialog_base/dialog_base_", ":/Dialog/dialog_base_", ":/Dialog/Dialog_base_",
                               ":/ToolTip/Balloon_Common_", ":/Pane_Tab/Pane_"}) {
        const QString frame = QLatin1String(prefix);
        const QSize corner = QImage(frame + QStringLiteral("Upper_Left")).size();
        QVERIFY2(!corner.isEmpty(), prefix);
        for (const char* row : ROWS) {
            // One family spells its lowest row in small letters.
            const QString rowName = frame.startsWith(QLatin1String(":/dialog_base")) && row == ROWS[2]
                                        ? QStringLiteral("bottom")
                                        : QString::fromLatin1(row);
            for (const char* column : COLUMNS) {
                const QString name = frame + rowName + QLatin1String(column);
                const QSize size = QImage(name).size();
                QVERIFY2(!size.isEmpty(), qPrintable(name));
                if (row != ROWS[1])
                    QVERIFY2(size.height() == corner.height(), qPrintable(name));
                if (column != COLUMNS[1])
                    QVERIFY2(size.width() == corner.width(), qPrintable(name));
            }
        }
    }
}

void tst_artwork_names::sizesAreThoseOfTheWidgets_data()
{
    QTest::addColumn<QString>("pattern"); // choices in braces
    QTest::addColumn<QSize>("size");      // 0 stands for any
    const auto row = [](const char* pattern, int width, int height) {
        QTest::newRow(pattern) << QString::fromLatin1(pattern) << QSize(width, height);
    };
    row(":/Icon_{|Disabled_}{Folder|Text|Delete|Undo|Redo}", 120, 67);
    row(":/Icon_{SafeArea|Canvas|Close}", 120, 67);
    row(":/ToolsBar_Buttons/Button_67{_Pressed|selected_Rest|selected_Pressed}{_Left|_Center|_Right}", 0, 67);
    row(":/TextToolPanel_Buttons/Button_48{|selected}{_Rest|_Pressed|_Disabled}{_Left|_Center|_Right}", 0,
        48);
    row(":/TextToolPanel_Buttons/Button-38{B|selected}{_Rest|_Pressed|_Disabled}{_Left|_Center|_Right}", 0,
        38);
    row(":/TextToolPanel_Buttons/Button_48{|_Disabled}_switch_separator", 3, 48);
    row(":/TextToolPanel_Buttons/Icon_{SizeDown|SizeUp|KerningSmaller|KerningLarger}{|_Disabled}", 48, 48);
    row(":/TextToolPanel_Buttons/Icon_Move{Up|Right|Down|Left}{|_Disabled}", 48, 48);
    row(":/TextToolPanel_Buttons/Icon_{AlignLeft|AlignCenter|AlignRight|Bold|Italic}{|_Selected|_Disabled}",
        48, 48);
    row(":/TextToolPanel_Buttons/Icon_{EdgeOff|EdgeOn}{|_Selected|_Disabled}", 48, 48);
    row(":/TextToolPanel_Buttons/Icon_Shadow{Off|Right|Center|Left}{|_Selected|_Disabled}", 48, 48);
    row(":/TextToolPanel_TextBox/TextBox_Edittable_{|Disable_}{Left|Center|Right}", 0, 48);
    row(":/TextToolPanel_TextBox/TextBox_Edittable_{|Disable_}Pulldown", 24, 48);
    row(":/{RadioButton|KSRadioButton}/Radiobutton_{On|Off}_{Rest|Pressed|Disabled}", 36, 36);
    row(":/CheckBox/Checkbox_{On|Off|Partial}_{Rest|Pressed|Disabled}", 36, 36);
    row(":/FolderPicker/{Titler_folder_icon|Picker_Icon_Enabel}", 28, 28);
    row(":/ToolBarbg_bluegrid", 1088, 742);
    row(":/Caret/Select_Handle_Single{|_Pressed}", 24, 27);
    row(":/Menu/List_Cursor", 0, 60);
    row(":/{Menu/Separator_H|Views/Separator_H}", 0, 2);
    row(":/{Separator_H|Pane_Tab/Separator_H}", 0, 4);
    row(":/Separator_V", 4, 0);
    row(":/Views/Separator_V", 2, 0);
    row(":/Menu/context_menu_allow", 28, 28);
    row(":/ToolTip/Balloon_Common_{Upper_Center_Allow-02|Bottom_Center_Allow}", 28, 28);
    row(":/Scrollbar/Scbar_base_v", 32, 0);
    row(":/Scrollbar/Scbar_base_h", 0, 32);
    row(":/Scrollbar/Scbar_handle_v_{rest|pressed}_{upper|center|bottom|center_interval}", 32, 0);
    row(":/Scrollbar/Scbar_handle_h_{rest|pressed}_{left|center|right|center_interval}", 0, 32);
    row(":/MainButtons/Main_Move_Handle", 22, 22);
    row(":/MainButtons/Main_drag_base_{Left|Center|Right}", 0, 139);
    row(":/Pane_Tab/Tab_{Rest|Pressed|Selected|Disabled}_{Left|Center|Right}", 0, 52);
    row(":/Views/Header_Main_1", 0, 40);
    row(":/Views/List_Cursor", 0, 60);
    row(":/Views/{Parts_011|Parts_012}_{Rest|Pressed|Disabled}", 36, 36);
    row(":/Views/{Recording_Icon|Loading_Icon-0{1|2|3|4|5|6|7|8}}", 28, 28);
    row(":/Picker/Picker_Allow_{Up|Dn}_Rest", 20, 20);
    row(":/Slider/Slider_S_Handle_{Rest|Pressed}", 30, 36);
    row(":/Slider/Slider_H_S_{Left|Center|Right}", 0, 12);
}

// All the names that a pattern with choices in braces stands for.
static QStringList expanded(const QString& pattern)
{
    const qsizetype close = pattern.indexOf(QLatin1Char('}'));
    if (close < 0)
        return {pattern};
    const qsizetype open = pattern.lastIndexOf(QLatin1Char('{'), close);
    QStringList result;
    const QStringList choices = pattern.mid(open + 1, close - open - 1).split(QLatin1Char('|'));
    for (const QString& choice : choices)
        result += expanded(pattern.left(open) + choice + pattern.mid(close + 1));
    return result;
}

void tst_artwork_names::sizesAreThoseOfTheWidgets()
{
    QFETCH(const QString, pattern);
    QFETCH(const QSize, size);
    const QStringList names = expanded(pattern);
    for (const QString& name : names) {
        const QSize found = QImage(name).size();
        QVERIFY2(!found.isEmpty(), qPrintable(name));
        QVERIFY2(size.width() == 0 || found.width() == size.width(), qPrintable(name));
        QVERIFY2(size.height() == 0 || found.height() == size.height(), qPrintable(name));
    }
}

void tst_artwork_names::canvasFrameSurroundsTheCanvas()
{
    const QImage frame(QStringLiteral(":/PanelBG/Titler_Canvas"));
    const QPoint canvas = QPoint(609, 97) - QPoint(579, 75);
    // The checkers fill exactly the canvas, and a rim goes round it.
    QSet<QRgb> inside;
    for (const QPoint& corner : {QPoint(0, 0), QPoint(1279, 0), QPoint(0, 719), QPoint(1279, 719)})
        inside.insert(frame.pixel(canvas + corner));
    QVERIFY(inside.size() <= 2);
    for (const QPoint& beside : {QPoint(-1, 0), QPoint(1280, 0), QPoint(0, -1), QPoint(0, 720)}) {
        QVERIFY(!inside.contains(frame.pixel(canvas + beside)));
        QCOMPARE(qAlpha(frame.pixel(canvas + beside)), 255);
    }
    QCOMPARE(qAlpha(frame.pixel(0, 0)), 0);
    QVERIFY(75 + frame.height() <= 845); // over the ruler below
}

QTEST_MAIN(tst_artwork_names)
#include "tst_artwork_names.moc"
