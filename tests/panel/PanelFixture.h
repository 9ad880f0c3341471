// The property panel in a window with simulated fingers, with log and settings in folders of the test.
#pragma once

#include "document/TText.h"
#include "panel/TextToolsPanel.h"
#include "support/IPathManagerEx.h"
#include "tests/fakes/FakeMessageBoxController.h"
#include "tests/support/LogFixture.h"
#include "tests/touchui/TouchDevice.h"

#include <QDir>
#include <QFile>
#include <QGuiApplication>
#include <QScreen>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTest>
#include <QTouchEvent>
#include <memory>

// The environment of one test program. Make it before anything is logged or settings are read.
class PanelEnvironment
{
public:
    PanelEnvironment()
    {
        Q_INIT_RESOURCE(TitlerToolResource);
        Q_INIT_RESOURCE(UILibrary);
        qputenv("K2SYS_AC_DATA", folder.path().toLocal8Bit());
        QDir(folder.path()).mkpath(QStringLiteral("defaultuser"));
        QFile paths(folder.filePath(QStringLiteral("defaultuser/PathInfo.xml")));
        if (paths.open(QIODevice::WriteOnly))
            paths.write("<?xml version=\"1.0\"?><PathInfo><SystemSetting path=\"settings\"/><Font "
                        "path=\"fonts\"/></PathInfo>");
        paths.close();
    }
    ~PanelEnvironment() { IPathManagerEx::clearUp(); }

    // Returns "[area] number: text" for each line of the operation log since the last call.
    QStringList newLogLines() { return log.takeOperations(); }

    // Returns the same for the debug log.
    QStringList newDebugLines() { return log.takeDebugLines(); }

    // Moves the window so that the point is on the screen, which is smaller than that of the appliance.
    void bringOnScreen(QWidget* widget, QPoint point)
    {
        const QPoint global = widget->mapToGlobal(point);
        if (!QGuiApplication::primaryScreen()->geometry().contains(global))
            widget->window()->move(widget->window()->pos() - global + QPoint(400, 400));
    }
    void touch(QWidget* widget, QPoint point)
    {
        bringOnScreen(widget, point);
        device.tap(widget, point);
    }
    void tap(QWidget* widget) { touch(widget, widget->rect().center()); }

    QTemporaryDir folder;
    FakeMessageBoxController messages;
    TouchDevice device;
    LogFixture log;
};

// Returns a record with one plain character for each letter.
inline TText plainText(const QString& letters = QStringLiteral("Abc"))
{
    TText text;
    text.setTextObjectID(1);
    text.setXValue(100);
    text.setYValue(200);
    std::vector<TextStyle*> items;
    for (const QChar letter : letters) {
        items.push_back(new TextStyle);
        items.back()->setText(QString(letter).toStdString());
        items.back()->setFontSize(64);
    }
    text.setTextItems(items);
    return text;
}

// Returns a record of three characters that differ in every property.
inline TText mixedText()
{
    TText text = plainText();
    const char* const families[] = {"KST", "DejaVu Sans", "DejaVu Serif"};
    const char* const colors[] = {"#C80000", "#123456", "#FFF700"};
    for (int i = 0; i < 3; ++i) {
        TextStyle* item = text.textItems().at(size_t(i));
        item->setFontFamily(families[i]);
        item->setFontColor(colors[i]);
        item->setFontSize(64 - 24 * (i % 2));
        item->setFontBold(i == 0 ? 1 : 0);
        item->setIsTextItalic(i == 2 ? 1 : 0);
        item->setTextKerning(80 + 20 * i);
        item->setIsTextEdge(i == 2 ? 1 : 0);
        TEdge edge;
        edge.setEdgeColor(colors[2 - i]);
        edge.setEdgeWidth(i + 3);
        item->setTextEdge(edge);
    }
    text.setTextAlign(1);
    text.setShadowStyle(2);
    return text;
}

inline QList<QString> colorsOf(const TText& text)
{
    QList<QString> colors;
    for (const TextStyle* item : text.textItems())
        colors << QString::fromStdString(item->getFontColor());
    return colors;
}

// A copy of what the panel sent last, since the record is valid only during the signal.
struct SentStyle {
    TText style;
    int id = -1;
    int undoFlag = -1;
};

// An enabled panel that records what it sends.
class Panel
{
public:
    explicit Panel(PanelEnvironment& surroundings) : environment(surroundings)
    {
        window.resize(1363, 220);
        panel = new TextToolsPanel(&window);
        panel->setGeometry(0, 0, 1363, 209);
        QObject::connect(panel, &TextToolsPanel::textStyleChange, panel,
                         [this](TText* style, int id, int undoFlag) {
                             sent.append({*style, id, undoFlag});
                         });
        window.show();
    }
    ~Panel() { environment.newLogLines(); }

    // Shows the record like that of an object selected as a whole.
    void select(TText text, bool shadowAlign = true, bool move = true)
    {
        panel->selectionModeForShadowAndAlign(shadowAlign, move);
        panel->updateTextStyle(&text);
        environment.newLogLines();
    }
    template <typename Widget>
    Widget* find(const char* name = nullptr) const
    {
        return panel->findChild<Widget*>(name ? QString::fromLatin1(name) : QString());
    }
    void tap(const char* button) { environment.tap(find<QWidget>(button)); }

    PanelEnvironment& environment;
    QWidget window;
    TextToolsPanel* panel = nullptr; // owned by the window
    QList<SentStyle> sent;
};
