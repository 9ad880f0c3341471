// The pictures are legible, their states are told apart, and their pieces fit.
#include "resources/artwork/DesignTokens.h"
#include "tests/resources/PictureMeasures.h"

#include <QDir>
#include <QImage>
#include <QTest>

using namespace PictureMeasures;

namespace
{

constexpr double ENABLED_CONTRAST = 4.5;
constexpr double DISABLED_CONTRAST = 2.0;
// The smallest differences between two states: of the mean colour of a face, and of the colour of a patch of
// a mark that is large enough to be seen from an arm's length.
constexpr double FACE_DIFFERENCE = 8.0;
constexpr double MARK_DIFFERENCE = 16.0;
constexpr double SHAPE_DIFFERENCE = 12.0; // where only the shape changes
constexpr int PATCH = 6;
constexpr int SEAM = 1;   // levels; rounding of scaling
constexpr int MIRROR = 2; // levels; rounding of curves

const QStringList ACROSS{QStringLiteral("Left"), QStringLiteral("Center"), QStringLiteral("Right")};
const QStringList ACROSS_SMALL{QStringLiteral("left"), QStringLiteral("center"), QStringLiteral("right")};
const QStringList DOWN{QStringLiteral("upper"), QStringLiteral("center"), QStringLiteral("bottom")};
const QStringList BUTTON_STATES{
    QStringLiteral("_Rest"),         QStringLiteral("_Pressed"),         QStringLiteral("_Disabled"),
    QStringLiteral("selected_Rest"), QStringLiteral("selected_Pressed"), QStringLiteral("selected_Disabled")};
const Scaling SCALINGS[] = {Scaling::Nearest, Scaling::Smooth};

QString panelButton(const QString& state)
{
    return QStringLiteral(":/TextToolPanel_Buttons/Button_48") + state + QLatin1Char('_');
}

// The face of a button, from its centre piece, laid on the panel.
QImage face(const QString& base)
{
    return on(Tokens::PANEL, QImage(base + QStringLiteral("Center")));
}

double leastContrast(const QImage& opaqueFace, int fromRow, int toRow, const QColor& ink)
{
    double least = 21;
    for (int y = fromRow; y <= toRow; ++y)
        least = qMin(least, contrast(opaqueFace.pixelColor(opaqueFace.width() / 2, y), ink));
    return least;
}

QStringList picturesIn(const QString& folder, const QString& pattern)
{
    QStringList names = QDir(folder).entryList({pattern}, QDir::Files);
    for (QString& name : names)
        name.prepend(folder + QLatin1Char('/'));
    return names;
}

bool isDisabled(const QString& name)
{
    return name.contains(QLatin1String("Disable"));
}

} // namespace

class tst_artwork : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void measuresMeasure();
    void toolIconsAreLegible();
    void panelIconsAreLegible();
    void iconsShareOneSize();
    void labelsAreLegible_data();
    void labelsAreLegible();
    void marksAreLegible();
    void signsAreLegible();
    void buttonStatesDiffer_data();
    void buttonStatesDiffer();
    void markStatesDiffer_data();
    void markStatesDiffer();
    void rowPiecesFit_data();
    void rowPiecesFit();
    void columnPiecesFit_data();
    void columnPiecesFit();
    void framesFit_data();
    void framesFit();
    void tipsJoinTheirFrames_data();
    void tipsJoinTheirFrames();
    void tabsJoinTheirPane();
    void stretchedPicturesAreFlat_data();
    void stretchedPicturesAreFlat();
    void lightFallsFromAbove();
};

void tst_artwork::initTestCase()
{
    Q_INIT_RESOURCE(TitlerToolResource);
    Q_INIT_RESOURCE(UILibrary);
}

void tst_artwork::measuresMeasure()
{
    QVERIFY(qAbs(contrast(Qt::white, Qt::black) - 21) < 0.01);
    QVERIFY(qAbs(contrast(QColor(118, 118, 118), Qt::white) - 4.54) < 0.02);
    QVERIFY(qAbs(difference(Qt::white, Qt::black) - 100) < 0.1);
    QCOMPARE(difference(Qt::red, Qt::red), 0.0);
    QImage stepped(10, 4, QImage::Format_RGB32);
    stepped.fill(QColor(10, 10, 10));
    stepped.setPixelColor(6, 2, QColor(10, 15, 10));
    QCOMPARE(largestStepAcross(stepped, 0, 9), 5);
    QCOMPARE(largestStepAcross(stepped, 0, 5), 0);
    QCOMPARE(largestStepDown(stepped, 0, 3), 5);
}

void tst_artwork::toolIconsAreLegible()
{
    const QString plate = QStringLiteral(":/ToolsBar_Buttons/Button_67");
    const QImage pressed = face(plate + QStringLiteral("_Pressed_"));
    const QImage selected = face(plate + QStringLiteral("selected_Rest_"));
    const QImage selectedPressed = face(plate + QStringLiteral("selected_Pressed_"));
    const QStringList icons = picturesIn(QStringLiteral(":"), QStringLiteral("Icon_*"));
    QVERIFY(icons.size() >= 13);
    for (const QString& name : icons) {
        const QImage icon(name);
        const QColor ink = inkOf(icon);
        QVERIFY2(ink.isValid(), qPrintable(name));
        const QRect rect = inkRect(icon);
        if (isDisabled(name)) {
            QVERIFY2(contrast(ink, Tokens::PANEL) >= DISABLED_CONTRAST, qPrintable(name));
            continue;
        }
        QVERIFY2(contrast(ink, Tokens::PANEL) >= ENABLED_CONTRAST, qPrintable(name));
        for (const QImage& under : {pressed, selected, selectedPressed}) {
            QVERIFY2(leastContrast(under, rect.top(), rect.bottom(), ink) >= ENABLED_CONTRAST,
                     qPrintable(name));
        }
    }
}

void tst_artwork::panelIconsAreLegible()
{
    const QStringList icons = picturesIn(QStringLiteral(":/TextToolPanel_Buttons"), QStringLiteral("Icon_*"));
    QVERIFY(icons.size() >= 49);
    for (const QString& name : icons) {
        const QImage icon(name);
        const QColor ink = inkOf(icon);
        QVERIFY2(ink.isValid(), qPrintable(name));
        const QRect rect = inkRect(icon);
        const bool isSelected = name.endsWith(QLatin1String("_Selected"));
        for (const QString& state : BUTTON_STATES) {
            // A disabled icon lies on both disabled faces, a selected one on the selected ones.
            if (isDisabled(name) != isDisabled(state) ||
                (!isDisabled(name) && isSelected != state.startsWith(QLatin1String("selected"))))
                continue;
            const double least = leastContrast(face(panelButton(state)), rect.top(), rect.bottom(), ink);
            QVERIFY2(least >= (isDisabled(name) ? DISABLED_CONTRAST : ENABLED_CONTRAST),
                     qPrintable(QStringLiteral("%1 on %2: %3").arg(name, state).arg(least)));
        }
    }
}

void tst_artwork::iconsShareOneSize()
{
    const QStringList icons = picturesIn(QStringLiteral(":"), QStringLiteral("Icon_*")) +
                              picturesIn(QStringLiteral(":/TextToolPanel_Buttons"), QStringLiteral("Icon_*"));
    for (const QString& name : icons) {
        const QImage icon(name);
        const QRect rect = inkRect(icon);
        const int extent = qMax(rect.width(), rect.height());
        // The sign of a menu beside the canvas makes that icon wider.
        const int widest = name == QLatin1String(":/Icon_Canvas") ? 52 : 36;
        QVERIFY2(extent >= 24 && extent <= widest,
                 qPrintable(QStringLiteral("%1: %2").arg(name).arg(extent)));
        // In the middle of the picture.
        QVERIFY2(qAbs(rect.center().x() - (icon.width() - 1) / 2.0) <= 3.5,
                 qPrintable(QStringLiteral("%1: %2").arg(name).arg(rect.center().x())));
        // The icon is sharp: most of its pixels are opaque.
        int touched = 0;
        int full = 0;
        for (int y = rect.top(); y <= rect.bottom(); ++y) {
            for (int x = rect.left(); x <= rect.right(); ++x) {
                const int alpha = qAlpha(icon.pixel(x, y));
                touched += alpha > 0 ? 1 : 0;
                full += alpha > 200 ? 1 : 0;
            }
        }
        QVERIFY2(full * 100 >= touched * 35,
                 qPrintable(QStringLiteral("%1: %2 of %3").arg(name).arg(full).arg(touched)));
    }
}

void tst_artwork::labelsAreLegible_data()
{
    QTest::addColumn<QString>("picture"); // a face that labels lie on
    QTest::addColumn<QColor>("ink");
    QTest::addColumn<double>("least");
    for (const char* family : {"TextToolPanel_Buttons/Button_48", "TextToolPanel_Buttons/Button-38"}) {
        for (const QString& state : BUTTON_STATES) {
            QString name = QStringLiteral(":/") + QLatin1String(family);
            if (name.endsWith(QLatin1String("38")) && state.startsWith(QLatin1Char('_')))
                name += QLatin1Char('B');
            name += state + QStringLiteral("_Center");
            QTest::newRow(qPrintable(name))
                << name << (isDisabled(state) ? Tokens::TEXT_DISABLED : Tokens::TEXT)
                << (isDisabled(state) ? DISABLED_CONTRAST : ENABLED_CONTRAST);
        }
    }
    const auto row = [](const char* name, const QColor& ink, double least) {
        QTest::newRow(name) << QString::fromLatin1(name) << ink << least;
    };
    row(":/TextToolPanel_TextBox/TextBox_Edittable_Center", Tokens::TEXT, ENABLED_CONTRAST);
    row(":/TextToolPanel_TextBox/TextBox_Edittable_Disable_Center", Tokens::TEXT_DISABLED, DISABLED_CONTRAST);
    row(":/Menu/List_Cursor", Tokens::TEXT, ENABLED_CONTRAST);
    row(":/Views/List_Cursor", Tokens::TEXT, ENABLED_CONTRAST);
    row(":/Views/Header_Main_1", Tokens::TEXT, ENABLED_CONTRAST);
    row(":/Dialog/dialog_base_Middle_Center", Tokens::TEXT, ENABLED_CONTRAST);
    row(":/ToolTip/Balloon_Common_Middle_Center", Tokens::TEXT, ENABLED_CONTRAST);
    row(":/MainButtons/Main_drag_base_Center", Tokens::TEXT, ENABLED_CONTRAST);
    const QColor behind(160, 160, 160); // the label of a tab that is not in front
    row(":/Pane_Tab/Tab_Rest_Center", behind, ENABLED_CONTRAST);
    row(":/Pane_Tab/Tab_Pressed_Center", behind, ENABLED_CONTRAST);
    row(":/Pane_Tab/Tab_Selected_Center", Tokens::TEXT, ENABLED_CONTRAST);
    row(":/Pane_Tab/Tab_Disabled_Center", Tokens::TEXT_DISABLED, DISABLED_CONTRAST);
}

void tst_artwork::labelsAreLegible()
{
    QFETCH(const QString, picture);
    QFETCH(const QColor, ink);
    QFETCH(const double, least);
    const QImage image = on(Tokens::PANEL, QImage(picture));
    QVERIFY(!image.isNull());
    // A label takes the middle two thirds of the height.
    const int margin = image.height() / 6;
    const double found = leastContrast(image, margin, image.height() - 1 - margin, ink);
    QVERIFY2(found >= least, qPrintable(QString::number(found)));
}

void tst_artwork::marksAreLegible()
{
    // The ring or box against the list, and the mark inside against its fill.
    for (const char* kind :
         {"RadioButton/Radiobutton_", "KSRadioButton/Radiobutton_", "CheckBox/Checkbox_"}) {
        for (const char* state : {"Rest", "Pressed", "Disabled"}) {
            const QString name = QStringLiteral(":/") + QLatin1String(kind);
            const QImage off =
                on(Tokens::DIALOG, QImage(name + QStringLiteral("Off_") + QLatin1String(state)));
            const QImage set =
                on(Tokens::DIALOG, QImage(name + QStringLiteral("On_") + QLatin1String(state)));
            const double least = isDisabled(QLatin1String(state)) ? DISABLED_CONTRAST : ENABLED_CONTRAST;
            const QColor line = off.pixelColor(6, 18);
            QVERIFY2(contrast(line, Tokens::DIALOG) >= least, qPrintable(name + QLatin1String(state)));
            // The brightest of the mark against what lies between mark and line.
            QColor mark = Qt::black;
            for (int x = 10; x < 26; ++x) {
                const QColor at = set.pixelColor(x, 18);
                mark = at.lightness() > mark.lightness() ? at : mark;
            }
            QVERIFY2(contrast(mark, set.pixelColor(8, 18)) >= least, qPrintable(name + QLatin1String(state)));
        }
    }
}

void tst_artwork::signsAreLegible()
{
    for (const char* name :
         {":/Views/Parts_011_Rest", ":/Views/Parts_012_Rest", ":/Picker/Picker_Allow_Up_Rest",
          ":/Picker/Picker_Allow_Dn_Rest", ":/FolderPicker/Titler_folder_icon",
          ":/FolderPicker/Picker_Icon_Enabel", ":/MainButtons/Main_Move_Handle"}) {
        const QColor ink = inkOf(QImage(QLatin1String(name)));
        for (const QColor& ground : {Tokens::DIALOG, Tokens::FACE_TOP, Tokens::SELECTED_TOP})
            QVERIFY2(contrast(ink, ground) >= ENABLED_CONTRAST, name);
    }
    for (const char* name : {":/Views/Parts_011_Disabled", ":/Views/Parts_012_Disabled"})
        QVERIFY2(contrast(inkOf(QImage(QLatin1String(name))), Tokens::DIALOG) >= DISABLED_CONTRAST, name);
    // An open row is told from a closed one, too.
    for (const char* state : {"Rest", "Pressed", "Disabled"}) {
        const QString name = QStringLiteral(":/Views/Parts_%1_%2");
        const QImage closed =
            on(Tokens::DIALOG, QImage(name.arg(QStringLiteral("011"), QLatin1String(state))));
        const QImage open = on(Tokens::DIALOG, QImage(name.arg(QStringLiteral("012"), QLatin1String(state))));
        QVERIFY2(largestDifference(closed, open, PATCH) >= SHAPE_DIFFERENCE, state);
    }
    // The steps of the loading sign follow each other around.
    for (int step = 1; step <= 8; ++step) {
        const QString name = QStringLiteral(":/Views/Loading_Icon-0%1");
        const QImage now = on(Tokens::DIALOG, QImage(name.arg(step)));
        const QImage next = on(Tokens::DIALOG, QImage(name.arg(step % 8 + 1)));
        QVERIFY(largestDifference(now, next, PATCH) >= MARK_DIFFERENCE);
    }
}

void tst_artwork::buttonStatesDiffer_data()
{
    QTest::addColumn<QStringList>("faces");
    QStringList large;
    QStringList small;
    for (const QString& state : BUTTON_STATES) {
        large.append(panelButton(state));
        small.append(QStringLiteral(":/TextToolPanel_Buttons/Button-38") +
                     (state.startsWith(QLatin1Char('_')) ? QStringLiteral("B") : QString()) + state +
                     QLatin1Char('_'));
    }
    QTest::newRow("48") << large;
    QTest::newRow("38") << small;
    const QString tool = QStringLiteral(":/ToolsBar_Buttons/Button_67");
    QTest::newRow("67") << QStringList{tool + QStringLiteral("_Pressed_"),
                                       tool + QStringLiteral("selected_Rest_"),
                                       tool + QStringLiteral("selected_Pressed_")};
    const QString tab = QStringLiteral(":/Pane_Tab/Tab_");
    QTest::newRow("tab") << QStringList{tab + QStringLiteral("Rest_"), tab + QStringLiteral("Pressed_"),
                                        tab + QStringLiteral("Selected_")};
}

void tst_artwork::buttonStatesDiffer()
{
    QFETCH(const QStringList, faces);
    for (int one = 0; one < faces.size(); ++one) {
        for (int other = one + 1; other < faces.size(); ++other) {
            const QImage first = face(faces.at(one));
            const QImage second = face(faces.at(other));
            QVERIFY(!first.isNull() && first.size() == second.size());
            const double found = difference(mean(first, first.rect()), mean(second, second.rect()));
            const double patch = largestDifference(first, second, PATCH);
            const QString what = QStringLiteral("%1 and %2: %3, patch %4")
                                     .arg(faces.at(one), faces.at(other))
                                     .arg(found)
                                     .arg(patch);
            QVERIFY2(found >= FACE_DIFFERENCE || patch >= MARK_DIFFERENCE, qPrintable(what));
        }
    }
}

void tst_artwork::markStatesDiffer_data()
{
    QTest::addColumn<QStringList>("names");
    for (const char* kind : {"RadioButton/Radiobutton", "KSRadioButton/Radiobutton", "CheckBox/Checkbox"}) {
        QStringList names;
        for (const char* value : {"On", "Off", "Partial"}) {
            for (const char* state : {"Rest", "Pressed", "Disabled"}) {
                if (qstrcmp(value, "Partial") != 0 || qstrcmp(kind, "CheckBox/Checkbox") == 0) {
                    names.append(QStringLiteral(":/%1_%2_%3")
                                     .arg(QLatin1String(kind), QLatin1String(value), QLatin1String(state)));
                }
            }
        }
        QTest::newRow(kind) << names;
    }
    for (const char* part : {"011", "012"}) {
        QStringList signs;
        for (const char* state : {"Rest", "Pressed", "Disabled"}) {
            signs.append(
                QStringLiteral(":/Views/Parts_%1_%2").arg(QLatin1String(part), QLatin1String(state)));
        }
        QTest::newRow(part) << signs;
    }
    QTest::newRow("slider") << QStringList{QStringLiteral(":/Slider/Slider_S_Handle_Rest"),
                                           QStringLiteral(":/Slider/Slider_S_Handle_Pressed")};
    QTest::newRow("caret") << QStringList{QStringLiteral(":/Caret/Select_Handle_Single"),
                                          QStringLiteral(":/Caret/Select_Handle_Single_Pressed")};
    QTest::newRow("scroll bar") << QStringList{QStringLiteral(":/Scrollbar/Scbar_handle_v_rest_center"),
                                               QStringLiteral(":/Scrollbar/Scbar_handle_v_pressed_center")};
    QTest::newRow("scroll bar across")
        << QStringList{QStringLiteral(":/Scrollbar/Scbar_handle_h_rest_center"),
                       QStringLiteral(":/Scrollbar/Scbar_handle_h_pressed_center")};
    QTest::newRow("text box") << QStringList{
        QStringLiteral(":/TextToolPanel_TextBox/TextBox_Edittable_Pulldown"),
        QStringLiteral(":/TextToolPanel_TextBox/TextBox_Edittable_Disable_Pulldown")};
}

void tst_artwork::markStatesDiffer()
{
    QFETCH(const QStringList, names);
    for (int one = 0; one < names.size(); ++one) {
        for (int other = one + 1; other < names.size(); ++other) {
            const QImage first = on(Tokens::DIALOG, QImage(names.at(one)));
            const QImage second = on(Tokens::DIALOG, QImage(names.at(other)));
            QVERIFY(!first.isNull() && first.size() == second.size());
            const double found = largestDifference(first, second, PATCH);
            QVERIFY2(
                found >= MARK_DIFFERENCE,
                qPrintable(QStringLiteral("%1 and %2: %3").arg(names.at(one), names.at(other)).arg(found)));
        }
    }
}

void tst_artwork::rowPiecesFit_data()
{
    QTest::addColumn<QString>("base");
    QTest::addColumn<QStringList>("names");
    const auto row = [](const QString& base, const QStringList& names) {
        QTest::newRow(qPrintable(base + names.last())) << base << names;
    };
    for (const QString& state : BUTTON_STATES)
        row(panelButton(state), ACROSS);
    for (const char* state : {"B_Rest", "B_Pressed", "B_Disabled", "selected_Rest", "selected_Pressed"})
        row(QStringLiteral(":/TextToolPanel_Buttons/Button-38%1_").arg(QLatin1String(state)), ACROSS);
    for (const char* state : {"_Pressed", "selected_Rest", "selected_Pressed"})
        row(QStringLiteral(":/ToolsBar_Buttons/Button_67%1_").arg(QLatin1String(state)), ACROSS);
    for (const char* state : {"Rest", "Pressed", "Selected", "Disabled"})
        row(QStringLiteral(":/Pane_Tab/Tab_%1_").arg(QLatin1String(state)), ACROSS);
    for (const char* form : {"", "Disable_"}) {
        const QString base =
            QStringLiteral(":/TextToolPanel_TextBox/TextBox_Edittable_%1").arg(QLatin1String(form));
        row(base, ACROSS);
        row(base, {QStringLiteral("Left"), QStringLiteral("Center"), QStringLiteral("Pulldown")});
    }
    row(QStringLiteral(":/Slider/Slider_H_S_"), ACROSS);
    row(QStringLiteral(":/MainButtons/Main_drag_base_"), ACROSS);
    row(QStringLiteral(":/Scrollbar/Scbar_handle_h_rest_"), ACROSS_SMALL);
    row(QStringLiteral(":/Scrollbar/Scbar_handle_h_pressed_"), ACROSS_SMALL);
}

void tst_artwork::rowPiecesFit()
{
    QFETCH(const QString, base);
    QFETCH(const QStringList, names);
    const QSize first = QImage(base + names.at(0)).size();
    const int last = QImage(base + names.at(2)).width();
    for (const Scaling scaling : SCALINGS) {
        for (const int width : {first.width() + last, first.width() + last + 1, 70, 257, 505, 1920}) {
            if (width < first.width() + last)
                continue;
            const QImage image = threePieces(base, names, QSize(width, first.height()), scaling);
            // From the last column of the one end to the first of the other nothing changes.
            QVERIFY2(largestStepAcross(image, first.width() - 1, width - last) <= SEAM,
                     qPrintable(QString::number(width)));
        }
    }
}

void tst_artwork::columnPiecesFit_data()
{
    QTest::addColumn<QString>("base");
    QTest::newRow("rest") << QStringLiteral(":/Scrollbar/Scbar_handle_v_rest_");
    QTest::newRow("pressed") << QStringLiteral(":/Scrollbar/Scbar_handle_v_pressed_");
}

void tst_artwork::columnPiecesFit()
{
    QFETCH(const QString, base);
    const QSize first = QImage(base + DOWN.at(0)).size();
    const int last = QImage(base + DOWN.at(2)).height();
    for (const Scaling scaling : SCALINGS) {
        for (const int height : {first.height() + last, 42, 300, 998}) {
            const QImage image = threePiecesDown(base, DOWN, QSize(first.width(), height), scaling);
            QVERIFY(largestStepDown(image, first.height() - 1, height - last) <= SEAM);
        }
    }
    // The grip lies over the middle: its sides are those of the handle, and a handle of 42 has room for it.
    const QImage grip(base + QStringLiteral("center_interval"));
    const QImage center(base + QStringLiteral("center"));
    QVERIFY(first.height() + grip.height() + last <= 42);
    for (int y = 0; y < grip.height(); ++y) {
        for (int x = 0; x < 8; ++x) {
            QCOMPARE(grip.pixel(x, y), center.pixel(x, 0));
            QCOMPARE(grip.pixel(grip.width() - 1 - x, y), center.pixel(grip.width() - 1 - x, 0));
        }
    }
}

void tst_artwork::framesFit_data()
{
    QTest::addColumn<QString>("prefix");
    for (const char* prefix :
         {":/PanelBG/Pane_1_", ":/PanelBG/Pane_2_", ":/PanelBG/Dialog_base_", ":/dialog_base/dialog_base_",
          ":/Dialog/dialog_base_", ":/Dialog/Dialog_base_", ":/ToolTip/Balloon_Common_", ":/Pane_Tab/Pane_"})
        QTest::newRow(prefix) << QString::fromLatin1(prefix);
}

void tst_artwork::framesFit()
{
    QFETCH(const QString, prefix);
    const QSize corner = QImage(prefix + QStringLiteral("Upper_Left")).size();
    for (const Scaling scaling : SCALINGS) {
        for (const QSize& size : {2 * corner, 2 * corner + QSize(1, 1), QSize(200, 210), QSize(547, 1002),
                                  QSize(1371, 833), QSize(1920, 1080)}) {
            const QImage image = ninePieces(prefix, size, scaling);
            QVERIFY2(largestStepAcross(image, corner.width() - 1, size.width() - corner.width()) <= SEAM,
                     qPrintable(QString::number(size.width())));
            QVERIFY2(largestStepDown(image, corner.height() - 1, size.height() - corner.height()) <= SEAM,
                     qPrintable(QString::number(size.height())));
            // No hole in the middle.
            QCOMPARE(qAlpha(image.pixel(size.width() / 2, size.height() / 2)), 255);
        }
    }
    // The corners mirror each other from left to right.
    const QImage smallest = on(Tokens::PANEL, ninePieces(prefix, 2 * corner, Scaling::Nearest));
    for (int y = 0; y < smallest.height(); ++y) {
        for (int x = 0; x < corner.width(); ++x) {
            const int left = qGray(smallest.pixel(x, y));
            const int right = qGray(smallest.pixel(smallest.width() - 1 - x, y));
            QVERIFY2(qAbs(left - right) <= MIRROR, qPrintable(QStringLiteral("(%1, %2)").arg(x).arg(y)));
        }
    }
}

void tst_artwork::tipsJoinTheirFrames_data()
{
    QTest::addColumn<QString>("tip");
    QTest::addColumn<QString>("row");
    QTest::addColumn<bool>("isBelow");
    QTest::newRow("menu") << QStringLiteral(":/Menu/context_menu_allow")
                          << QStringLiteral(":/Dialog/dialog_base_Upper_Center") << false;
    QTest::newRow("balloon above") << QStringLiteral(":/ToolTip/Balloon_Common_Upper_Center_Allow-02")
                                   << QStringLiteral(":/ToolTip/Balloon_Common_Upper_Center") << false;
    QTest::newRow("balloon below") << QStringLiteral(":/ToolTip/Balloon_Common_Bottom_Center_Allow")
                                   << QStringLiteral(":/ToolTip/Balloon_Common_Bottom_Center") << true;
}

void tst_artwork::tipsJoinTheirFrames()
{
    QFETCH(const QString, tip);
    QFETCH(const QString, row);
    QFETCH(const bool, isBelow);
    const QImage picture(tip);
    const QImage rim(row);
    const int top = isBelow ? 0 : picture.height() - rim.height();
    for (int y = 0; y < rim.height(); ++y) {
        QCOMPARE(picture.pixel(0, top + y), rim.pixel(0, y));
        QCOMPARE(picture.pixel(picture.width() - 1, top + y), rim.pixel(0, y));
    }
    // Under the tip the rim is open: the face goes up into it.
    const int mouth = isBelow ? rim.height() - 1 : top;
    const QImage inside = QImage(QString(row)
                                     .replace(QLatin1String("Upper"), QLatin1String("Middle"))
                                     .replace(QLatin1String("Bottom"), QLatin1String("Middle")));
    QCOMPARE(picture.pixel(picture.width() / 2, mouth), inside.pixel(0, 0));
    // The tip ends in the middle and nothing stands beside it.
    QCOMPARE(qAlpha(picture.pixel(0, isBelow ? picture.height() - 1 : 0)), 0);
    const QRect ink = inkRect(picture);
    QCOMPARE(ink.top(), isBelow ? 0 : ink.top());
    QVERIFY(ink.height() >= picture.height() - 1);
}

void tst_artwork::tabsJoinTheirPane()
{
    const QImage paneTop(QStringLiteral(":/Pane_Tab/Pane_Upper_Center"));
    const QRgb paneFace = QImage(QStringLiteral(":/Pane_Tab/Pane_Middle_Center")).pixel(0, 0);
    const QImage front(QStringLiteral(":/Pane_Tab/Tab_Selected_Center"));
    for (int y = front.height() - Tokens::TAB_LINE; y < front.height(); ++y)
        QCOMPARE(front.pixel(0, y), paneFace);
    for (const char* state : {"Rest", "Pressed", "Disabled"}) {
        const QImage behind(QStringLiteral(":/Pane_Tab/Tab_%1_Center").arg(QLatin1String(state)));
        for (int line = 0; line < Tokens::TAB_LINE; ++line)
            QCOMPARE(behind.pixel(0, behind.height() - Tokens::TAB_LINE + line), paneTop.pixel(0, line));
    }
}

void tst_artwork::stretchedPicturesAreFlat_data()
{
    QTest::addColumn<bool>("isAcross"); // the way it is stretched
    for (const char* name :
         {":/Separator_H", ":/Menu/Separator_H", ":/Views/Separator_H", ":/Pane_Tab/Separator_H",
          ":/Menu/List_Cursor", ":/Views/List_Cursor", ":/Views/Header_Main_1", ":/Scrollbar/Scbar_base_h"})
        QTest::newRow(name) << true;
    for (const char* name : {":/Separator_V", ":/Views/Separator_V", ":/Scrollbar/Scbar_base_v"})
        QTest::newRow(name) << false;
}

void tst_artwork::stretchedPicturesAreFlat()
{
    QFETCH(const bool, isAcross);
    const QImage image(QString::fromLatin1(QTest::currentDataTag()));
    QVERIFY(!image.isNull());
    QCOMPARE(isAcross ? largestStepAcross(image, 0, image.width() - 1)
                      : largestStepDown(image, 0, image.height() - 1),
             0);
}

void tst_artwork::lightFallsFromAbove()
{
    for (const QString& state : {QStringLiteral("_Rest"), QStringLiteral("selected_Rest")}) {
        const QImage image = face(panelButton(state));
        QVERIFY(image.pixelColor(4, 3).lightness() > image.pixelColor(4, image.height() - 4).lightness());
    }
    // A sunken shape has its shadow at the top.
    const QImage box = face(QStringLiteral(":/TextToolPanel_TextBox/TextBox_Edittable_"));
    QVERIFY(box.pixelColor(4, 1).lightness() < box.pixelColor(4, box.height() - 2).lightness());
    const QImage groove(QStringLiteral(":/Separator_H"));
    QVERIFY(groove.pixelColor(0, 0).lightness() < groove.pixelColor(0, groove.height() - 1).lightness());
}

QTEST_MAIN(tst_artwork)
#include "tst_artwork.moc"
