// Interrupts the touch on every touch widget of the gallery in every way.
#include "Interruptions.h"
#include "gallery/GalleryPages.h"
#include "gallery/GalleryScreen.h"

#include <QApplication>
#include <QFont>
#include <QTest>

class tst_gallerypages_interruptions : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup()
    {
        m_page.close();
        APPEventFilter::release();
    }
    void everyWidget_data();
    void everyWidget();
    void everyClassIsThere();

private:
    void open(int page);
    void destroy(QWidget* widget);

    ManualClock m_clock; // before all widgets
    GalleryPage m_page;
    static inline QStringList s_names;
};

// Restores the page and its popups, with no finger on them.
void tst_gallerypages_interruptions::open(int page)
{
    m_page.close();
    m_page = GalleryPages::all().at(page)();
    m_page.show();
    QCoreApplication::processEvents();
    Fingers posing;
    m_page.pose(posing);
    posing.cancel();
    QCoreApplication::processEvents();
    m_clock.advance(5000);
}

// A row is tested alone, any other widget with its ancestors.
void tst_gallerypages_interruptions::destroy(QWidget* widget)
{
    if (widget->window() != m_page.window.get() || widget->isWindow()) {
        m_page.close();
        return;
    }
    while (!qobject_cast<KSBaseItemWidget*>(widget) && widget->parentWidget() != m_page.window.get())
        widget = widget->parentWidget();
    delete widget;
}

void tst_gallerypages_interruptions::everyWidget_data()
{
    QTest::addColumn<int>("page");
    for (int i = 0; i < GalleryPages::all().size(); ++i) {
        const QString name = GalleryPages::all().at(i)().name;
        QTest::newRow(qPrintable(name)) << i;
    }
}

void tst_gallerypages_interruptions::everyWidget()
{
    QFETCH(int, page);
    Interruptions touches(m_clock);
    touches.restore = [this, page] { open(page); };
    touches.destroy = [this](QWidget* widget) { destroy(widget); };
    QStringList result;
    const QStringList kinds = touches.kinds();
    for (const QString& name : kinds)
        for (const QString& problem : touches.problems(name))
            result.append(name + QStringLiteral(" after ") + problem);
    s_names += kinds;
    QVERIFY2(result.isEmpty(), qPrintable(QLatin1Char('\n') + result.join(QLatin1Char('\n'))));
}

// Checks that the walk finds the widgets.
void tst_gallerypages_interruptions::everyClassIsThere()
{
    const QString names = s_names.join(QLatin1Char('\n'));
    for (const char* part :
         {"KSPushbutton", "KSRadiobutton", "KSSLider", "KSCombobox", "CustomComboBoxView", "KSMenu",
          "KSTabBar", "KSScrollBar", "KSTreeView", "KSBaseItemWidget", "movable", "checkable", "ToolsBar"})
        QVERIFY2(names.contains(QLatin1String(part)), qPrintable(QLatin1String(part) + "\n" + names));
}

int main(int argc, char* argv[])
{
    const GalleryScreen screen;
    QApplication application(argc, argv);
    Q_INIT_RESOURCE(TitlerToolResource);
    Q_INIT_RESOURCE(UILibrary);
    QApplication::setFont(QFont(QStringLiteral("KST"), 12));
    tst_gallerypages_interruptions test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_gallerypages_interruptions.moc"
