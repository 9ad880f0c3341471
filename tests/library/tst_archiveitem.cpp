// The text lines of one title in the list: where they break, and the room that the handle of move mode takes.
#include "ItemLooks.h"
#include "LibraryFixture.h"

#include "library/ArchiveItem.h"

#include <QFontMetricsF>
#include <QLabel>
#include <QTest>
#include <algorithm>

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
    // Returns whether each line is narrow enough for its place.
    bool linesFit() const
    {
        const TitleLines* area = textArea(m_item.get());
        const QFontMetricsF metrics(area->lineFont());
        const QStringList lines = area->lines();
        return std::all_of(lines.cbegin(), lines.cend(), [&](const QString& line) {
            return metrics.horizontalAdvance(line) <= area->textRect(0).width();
        });
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
    QVERIFY2(linesFit(), qPrintable(textLines(m_item.get()).join('|')));
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
    QVERIFY2(linesFit(), qPrintable(textLines(m_item.get()).join('|')));
}

void tst_archiveitem::handleStandsBesideTheText()
{
    show(QStringLiteral("word ").repeated(60));
    const QStringList before = textLines(m_item.get());
    m_item->setDragFlag(true);
    const auto* handle = m_item->findChild<QLabel*>(QString(), Qt::FindDirectChildrenOnly);
    QVERIFY(handle);
    const TitleLines* area = textArea(m_item.get());
    for (int i = 0; i < 4; ++i)
        QVERIFY(!area->lineRect(i).translated(area->pos()).intersects(handle->geometry()));
    QVERIFY2(linesFit(), qPrintable(textLines(m_item.get()).join('|')));
    // A text that is set in move mode leaves room for the handle, too.
    show(QStringLiteral("other ").repeated(60));
    QVERIFY2(linesFit(), qPrintable(textLines(m_item.get()).join('|')));
    show(QStringLiteral("word ").repeated(60));
    m_item->setDragFlag(false);
    QCOMPARE(textLines(m_item.get()), before);
}

QTEST_MAIN(tst_archiveitem)
#include "tst_archiveitem.moc"
