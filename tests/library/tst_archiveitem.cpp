// The text lines of one title in the list: where they break, and the room that the handle of move mode takes.
#include "ItemLooks.h"
#include "LibraryFixture.h"

#include "library/ArchiveItem.h"

#include <QFontMetricsF>
#include <QLabel>
#include <QTest>

class tst_archiveitem : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup() { m_item.reset(); }
    void oneTextRunsOverTheLines();
    void wordLongerThanALine();
    void onlyTheLastLineIsElided();
    void handleStandsBesideTheText();

private:
    void show(const QString& text);
    QList<QLabel*> labels() const { return m_item->getRightChild()->findChildren<QLabel*>(); }
    static bool fits(const QLabel& label)
    {
        return QFontMetricsF(label.font()).horizontalAdvance(label.text()) <= label.contentsRect().width();
    }

    LibraryFixture m_fixture;
    Archive m_archive;
    std::unique_ptr<ArchiveItem> m_item;
};

namespace
{

constexpr QChar ELLIPSIS(0x2026);

} // namespace

void tst_archiveitem::initTestCase()
{
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
}

void tst_archiveitem::init()
{
    m_item = std::make_unique<ArchiveItem>(&m_archive, ArchiveItem::LIST_ITEM);
    m_item->setDragFlagAlignment(DRAGFLAG_RIGHT);
}

void tst_archiveitem::show(const QString& text)
{
    m_archive.releaseVectorText();
    m_archive.setText({LibraryFixture::makeText(text, 1)});
    if (m_item->hasChildWidgets())
        m_item->updateRightChild();
    else
        m_item->initArchiveItemChildWidget();
}

void tst_archiveitem::oneTextRunsOverTheLines()
{
    const QString text = QStringLiteral("The council votes tonight on the new bridge");
    show(text);
    const QStringList lines = textLines(m_item.get());
    QVERIFY(!lines.at(1).isEmpty());
    QVERIFY2(!lines.join(QString()).contains(ELLIPSIS), qPrintable(lines.join('|')));
    QCOMPARE(lines.join(' ').simplified(), text); // no word is lost or cut
    for (const QLabel* label : labels())
        QVERIFY2(fits(*label), qPrintable(label->text()));
}

void tst_archiveitem::wordLongerThanALine()
{
    const QString text = QStringLiteral("快讯快讯快讯快讯快讯快讯快讯快讯快讯快讯");
    show(text);
    QCOMPARE(textLines(m_item.get()).join(QString()), text);
    show(QString(30, QLatin1Char('W')));
    QCOMPARE(textLines(m_item.get()).join(QString()), QString(30, QLatin1Char('W')));
}

void tst_archiveitem::onlyTheLastLineIsElided()
{
    const QString text = QStringLiteral("word ").repeated(60).trimmed();
    show(text);
    QStringList lines = textLines(m_item.get());
    QCOMPARE(lines.size(), 4);
    QVERIFY2(lines.last().endsWith(ELLIPSIS), qPrintable(lines.last()));
    lines.last().chop(1);
    QVERIFY(text.startsWith(lines.join(' ').simplified()));
    QVERIFY(!lines.join(QString()).contains(ELLIPSIS));
    for (const QLabel* label : labels())
        QVERIFY2(fits(*label), qPrintable(label->text()));
}

void tst_archiveitem::handleStandsBesideTheText()
{
    show(QStringLiteral("word ").repeated(60));
    const QStringList before = textLines(m_item.get());
    m_item->setDragFlag(true);
    const auto* handle = m_item->findChild<QLabel*>(QString(), Qt::FindDirectChildrenOnly);
    QVERIFY(handle);
    for (const QLabel* label : labels()) {
        const QRect line(label->mapTo(m_item.get(), QPoint(0, 0)), label->size());
        QVERIFY2(!line.intersects(handle->geometry()), qPrintable(label->text()));
        QVERIFY2(fits(*label), qPrintable(label->text()));
    }
    // A text that is set in move mode leaves room for the handle, too.
    show(QStringLiteral("other ").repeated(60));
    for (const QLabel* label : labels())
        QVERIFY2(fits(*label), qPrintable(label->text()));
    show(QStringLiteral("word ").repeated(60));
    m_item->setDragFlag(false);
    QCOMPARE(textLines(m_item.get()), before);
}

QTEST_MAIN(tst_archiveitem)
#include "tst_archiveitem.moc"
