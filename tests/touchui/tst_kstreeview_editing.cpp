// Editors, check boxes and marks in the rows of the touch tree, and what it paints.
#include "TreeViewFixture.h"
#include "tests/support/Patience.h"
#include "tests/touchui/ShownTip.h"

class tst_kstreeview_editing : public TreeViewFixture
{
    Q_OBJECT

private Q_SLOTS:
    void editorOpensAndCommits();
    void editorCanBeReverted();
    void editorIgnoresRowsThatAreNotEditable();
    void selfEndingControlSurvivesTheLossOfFocus();
    void editorKeepsItsTextWhenTheRowChanges();
    void closingAStrangeEditorDoesNothing();
    void rowVanishesUnderTheEditor();

    void moveToSibling();
    void checkBoxesFollowEachOther();
    void checkedFolderChecksChildrenMadeLater();
    void checkBoxUnderTheFinger();
    void loadingMarksStep();
    void recordingMarks();
    void heldLongNameShowsABalloon();

    void designAttributes();
    void scrollBarsAreOurs();
    void paintsRowsToTheBottom();
    void paintsSelectionOverTheWholeRow();
    void paintsUnderAWindowStyleSheet();
    void operationFocusSurroundsTheEditedRow();
};

void tst_kstreeview_editing::editorOpensAndCommits()
{
    QSignalSpy initialised(m_tree->treeDelegate(), &CustomTreeDelegete::signalLineEditInitialize);
    QSignalSpy committed(m_tree->treeDelegate(), &CustomTreeDelegete::signalLineEditCommitted);
    const QModelIndex folder = m_model->index(2, 0);
    Q_EMIT m_tree->editorEvent(folder);
    auto* editor = m_tree->findChild<QLineEdit*>();
    QVERIFY(editor != nullptr);
    QCOMPARE(initialised.count(), 1);
    QCOMPARE(m_tree->getRenameIndex(), folder);
    QCOMPARE(editor->text(), QStringLiteral("Folder 002"));
    QVERIFY(m_tree->visualRect(folder).contains(editor->geometry()));
    editor->setText(QStringLiteral("Renamed"));
    m_tree->closeEditorState(editor, QAbstractItemDelegate::NoHint);
    QCOMPARE(folder.data().toString(), QStringLiteral("Renamed"));
    QCOMPARE(committed.count(), 1);
    QCOMPARE(committed.at(0).at(0).toString(), QStringLiteral("Renamed"));
    QVERIFY(!m_tree->getRenameIndex().isValid());
    QTRY_VERIFY(m_tree->findChild<QLineEdit*>() == nullptr);
}

void tst_kstreeview_editing::editorCanBeReverted()
{
    const QModelIndex folder = m_model->index(2, 0);
    Q_EMIT m_tree->editorEvent(folder);
    auto* editor = m_tree->findChild<QLineEdit*>();
    editor->setText(QStringLiteral("Renamed"));
    m_tree->closeEditorState(editor, QAbstractItemDelegate::RevertModelCache);
    QCOMPARE(folder.data().toString(), QStringLiteral("Folder 002"));
    QVERIFY(!m_tree->getRenameIndex().isValid());
}

void tst_kstreeview_editing::editorIgnoresRowsThatAreNotEditable()
{
    QTest::ignoreMessage(QtWarningMsg, "edit: editing failed");
    Q_EMIT m_tree->editorEvent(m_model->index(2, 1));
    QVERIFY(m_tree->findChild<QLineEdit*>() == nullptr);
    QVERIFY(!m_tree->getRenameIndex().isValid());
}

void tst_kstreeview_editing::selfEndingControlSurvivesTheLossOfFocus()
{
    Q_EMIT m_tree->editorEvent(m_model->index(2, 0));
    QPointer<QLineEdit> editor = m_tree->findChild<QLineEdit*>();
    editor->setText(QStringLiteral("Half a na"));
    m_tree->setFocus();
    QTest::keyClick(editor, Qt::Key_Return);
    QTest::keyClick(editor, Qt::Key_Escape);
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QVERIFY(editor != nullptr);
    QCOMPARE(m_model->index(2, 0).data().toString(), QStringLiteral("Folder 002"));
    m_tree->closeEditorState(editor, QAbstractItemDelegate::NoHint);
}

void tst_kstreeview_editing::editorKeepsItsTextWhenTheRowChanges()
{
    const QModelIndex folder = m_model->index(2, 0);
    Q_EMIT m_tree->editorEvent(folder);
    auto* editor = m_tree->findChild<QLineEdit*>();
    editor->selectAll();
    QTest::keyClicks(editor, QStringLiteral("typed"));
    m_model->setData(folder, QStringLiteral("from elsewhere"));
    QCOMPARE(editor->text(), QStringLiteral("typed"));
    m_tree->closeEditorState(editor, QAbstractItemDelegate::NoHint);
    QCOMPARE(folder.data().toString(), QStringLiteral("typed"));
}

void tst_kstreeview_editing::closingAStrangeEditorDoesNothing()
{
    QLineEdit stranger;
    m_tree->closeEditorState(&stranger, QAbstractItemDelegate::NoHint);
    m_tree->closeEditorState(nullptr, QAbstractItemDelegate::NoHint);
    QCOMPARE(m_model->index(0, 0).data().toString(), QStringLiteral("Folder 000"));
}

void tst_kstreeview_editing::rowVanishesUnderTheEditor()
{
    Q_EMIT m_tree->editorEvent(m_model->index(2, 0));
    QPointer<QLineEdit> editor = m_tree->findChild<QLineEdit*>();
    m_model->removeRow(2);
    QVERIFY(!m_tree->getRenameIndex().isValid());
    if (editor != nullptr)
        m_tree->closeEditorState(editor, QAbstractItemDelegate::NoHint);
    QCOMPARE(m_model->index(2, 0).data().toString(), QStringLiteral("Folder 003"));
}

void tst_kstreeview_editing::moveToSibling()
{
    QVERIFY(!m_tree->moveToSibling(m_model->index(2, 0)));
    QVERIFY(m_tree->insertRows(40, 1, QModelIndex()));
    m_tree->setCurrentIndex(m_model->index(40, 0));
    QVERIFY(m_tree->moveToSibling(m_model->index(2, 0)));
    QCOMPARE(m_tree->currentIndex().row(), 3);
    QVERIFY(m_tree->moveToSibling(m_model->index(2, 0)));
    QCOMPARE(m_tree->currentIndex().row(), 3);
    QVERIFY(m_tree->moveToSibling(m_model->index(40, 0)));
    QCOMPARE(m_tree->currentIndex().row(), 40);
    QVERIFY(!m_tree->moveToSibling(m_model->index(0, 0, m_model->index(0, 0))));
    QVERIFY(!m_tree->moveToSibling(QModelIndex()));
}

void tst_kstreeview_editing::checkBoxesFollowEachOther()
{
    m_source->checkable = true;
    m_model->createDataItems();
    const QModelIndex folder = m_model->index(1, 0);
    const auto state = [](const QModelIndex& index) { return index.data(Qt::CheckStateRole).toInt(); };
    QCOMPARE(m_model->rowCount(folder), 3);
    m_tree->changeCheckState(m_model->index(0, 0, folder));
    QCOMPARE(state(folder), static_cast<int>(Qt::PartiallyChecked));
    QCOMPARE(m_model->getOnOrPartialChildrenNumber(folder), 1);
    m_tree->changeCheckState(m_model->index(1, 0, folder));
    m_tree->changeCheckState(m_model->index(2, 0, folder));
    QCOMPARE(state(folder), static_cast<int>(Qt::Checked));
    m_tree->changeCheckState(folder);
    QCOMPARE(state(m_model->index(2, 0, folder)), static_cast<int>(Qt::Unchecked));
    QCOMPARE(m_model->getOnOrPartialChildrenNumber(folder), 0);
    m_tree->changeCheckState(folder);
    QCOMPARE(state(m_model->index(0, 0, folder)), static_cast<int>(Qt::Checked));
    QCOMPARE(m_model->getOnOrPartialChildrenNumber(folder), 3);
    m_model->setData(folder, false, KSVIEW::ItemEnableRole);
    m_tree->changeCheckState(folder);
    QCOMPARE(state(folder), static_cast<int>(Qt::Checked));
    m_tree->changeCheckState(QModelIndex());
}

void tst_kstreeview_editing::checkedFolderChecksChildrenMadeLater()
{
    m_source->checkable = true;
    m_model->createDataItems();
    const QModelIndex folder = m_model->index(1, 0);
    m_tree->changeCheckState(folder);
    QVERIFY(!m_model->areChildrenMade(folder));
    QCOMPARE(m_model->index(2, 0, folder).data(Qt::CheckStateRole).toInt(), static_cast<int>(Qt::Checked));
}

void tst_kstreeview_editing::checkBoxUnderTheFinger()
{
    m_source->checkable = true;
    m_model->createDataItems();
    const QModelIndex folder = m_model->index(1, 0);
    const QPoint box = m_tree->getCheckBoxRect(folder).center();
    QVERIFY(m_tree->getCheckBoxRectForTouch(folder).contains(m_tree->getCheckBoxRect(folder)));
    QCOMPARE(m_tree->getCheckBoxImageType(folder), KSTreeView::OffRest);
    QTest::touchEvent(m_area, m_device).press(0, box, m_area);
    QCOMPARE(m_tree->getCheckBoxImageType(folder), KSTreeView::OffPressed);
    QTest::touchEvent(m_area, m_device).release(0, box, m_area);
    QCOMPARE(m_tree->getCheckBoxImageType(folder), KSTreeView::OnRest);
    QVERIFY(!m_tree->currentIndex().isValid());
    QTest::touchEvent(m_area, m_device).press(0, box, m_area);
    QTest::touchEvent(m_area, m_device).move(0, box + QPoint(60, 0), m_area);
    QCOMPARE(m_tree->getCheckBoxImageType(folder), KSTreeView::OnRest);
    QTest::touchEvent(m_area, m_device).release(0, box, m_area);
    QCOMPARE(m_tree->getCheckBoxImageType(folder), KSTreeView::OnRest);
    m_tree->setCheckBoxVisible(false);
    QVERIFY(m_tree->getCheckBoxRect(folder).isNull());
    QVERIFY(m_tree->getCheckBoxRectForTouch(folder).isNull());
}

void tst_kstreeview_editing::loadingMarksStep()
{
    QCOMPARE(m_tree->getLoadingImagePath(1), QStringLiteral(":/Views/Loading_Icon-01"));
    QCOMPARE(m_tree->getLoadingImagePath(8), QStringLiteral(":/Views/Loading_Icon-08"));
    QCOMPARE(m_tree->getLoadingImagePath(9), QStringLiteral(":/Views/Loading_Icon-01"));
    QCOMPARE(m_tree->getLoadingImagePath(0), QStringLiteral(":/Views/Loading_Icon-08"));
    const QModelIndex folder = m_model->index(1, 0);
    m_model->setData(folder, 8, KSVIEW::ItemLoadingRole);
    m_tree->slotUpdateLoadingIcon();
    QCOMPARE(folder.data(KSVIEW::ItemLoadingRole).toInt(), 1);
    QTRY_COMPARE(folder.data(KSVIEW::ItemLoadingRole).toInt(), 3); // by its own timer
    m_tree->clearAllLoadingState();
    QCOMPARE(folder.data(KSVIEW::ItemLoadingRole).toInt(), 0);
    m_tree->slotUpdateLoadingIcon();
    QCOMPARE(folder.data(KSVIEW::ItemLoadingRole).toInt(), 0);
}

void tst_kstreeview_editing::recordingMarks()
{
    const QModelIndex folder = m_model->index(1, 0);
    const QRect cell = m_tree->visualRect(folder);
    QVERIFY(m_tree->getLayoutForFirstColumn(cell, folder).mark.isNull());
    m_model->setData(folder, true, KSVIEW::ItemRecordingRole);
    const auto layout = m_tree->getLayoutForFirstColumn(cell, folder);
    QVERIFY(cell.contains(layout.mark));
    QVERIFY(!layout.mark.intersects(layout.text));
    m_tree->clearRecording();
    QVERIFY(!m_model->isRecording(folder));
}

void tst_kstreeview_editing::heldLongNameShowsABalloon()
{
    const QModelIndex folder = m_model->index(1, 0);
    QVERIFY(!m_tree->isTextElide(folder));
    m_model->setData(folder, QString(120, QLatin1Char('W')));
    QVERIFY(m_tree->isTextElide(folder));
    m_tree->touch()->setHoldInterval(30);
    QTest::touchEvent(m_area, m_device).press(0, rowPoint(1), m_area);
    QTRY_VERIFY(shownTip() != nullptr);
    QTest::touchEvent(m_area, m_device).move(0, rowPoint(1) + QPoint(0, -4), m_area);
    QTest::touchEvent(m_area, m_device).move(0, rowPoint(1) + QPoint(0, -40), m_area);
    QVERIFY(shownTip() == nullptr);
    QTest::touchEvent(m_area, m_device).release(0, rowPoint(1) + QPoint(0, -40), m_area);
    KSToolTip::clearInstance();
}

void tst_kstreeview_editing::designAttributes()
{
    for (int role = 0; role < KSVIEW::DesignAttributeCount; ++role) {
        const auto design = static_cast<KSVIEW::enumDesignAttributeRole>(role);
        QVERIFY(m_tree->getDesignAttribute(design).isValid());
    }
    QVERIFY(!m_tree->getDesignAttribute(KSVIEW::DesignAttributeCount).isValid());
    m_tree->setDesignAttribute(KSVIEW::DesignRowHeight, 60);
    QCOMPARE(m_tree->getDesignAttribute(KSVIEW::DesignRowHeight).toInt(), 60);
    QTRY_COMPARE(m_tree->visualRect(m_model->index(2, 0)).height(), 60);
    m_model->setData(m_model->index(2, 0), 90, KSVIEW::ItemHeightRole);
    m_tree->doItemsLayout();
    QCOMPARE(m_tree->visualRect(m_model->index(2, 0)).height(), 90);
}

void tst_kstreeview_editing::scrollBarsAreOurs()
{
    QVERIFY(qobject_cast<KSScrollBar*>(m_tree->verticalScrollBar()) != nullptr);
    QVERIFY(qobject_cast<KSScrollBar*>(m_tree->horizontalScrollBar()) != nullptr);
    QVERIFY(m_tree->verticalScrollBar()->isVisible());
    QCOMPARE(m_tree->verticalScrollBar()->width(), 32);
    QVERIFY(qobject_cast<KSTreeHeaderView*>(m_tree->header()) != nullptr);
    m_model->removeRows(3, 37);
    QTRY_VERIFY(!m_tree->verticalScrollBar()->isVisible());
}

void tst_kstreeview_editing::paintsRowsToTheBottom()
{
    m_model->removeRows(2, 38);
    QTRY_COMPARE(m_tree->getEmptyArea(), QRect(0, 2 * ROW, m_area->width(), m_area->height() - 2 * ROW));
    const QImage image = m_area->grab().toImage();
    const int x = image.width() - 5;
    // The rule under each row, drawn or empty, and the plain ground between.
    for (int row = 0; row < 6; ++row) {
        QVERIFY(image.pixelColor(x, row * ROW + ROW - 1) != BACKGROUND ||
                image.pixelColor(x, row * ROW + ROW - 2) != BACKGROUND);
        QCOMPARE(image.pixelColor(x, row * ROW + 10), BACKGROUND);
    }
    m_model->removeRows(0, 2);
    QCOMPARE(m_tree->getEmptyArea(), m_area->rect());
}

void tst_kstreeview_editing::paintsSelectionOverTheWholeRow()
{
    m_tree->setCurrentIndex(m_model->index(2, 0));
    const QImage image = m_area->grab().toImage();
    for (const int x : {2, m_area->width() / 2, m_area->width() - 3}) {
        const QColor color = image.pixelColor(x, 2 * ROW + 6);
        QVERIFY2(color.blue() > 150 && color.red() < 70, qPrintable(color.name()));
        QCOMPARE(image.pixelColor(x, 3 * ROW + 6), BACKGROUND);
    }
}

void tst_kstreeview_editing::paintsUnderAWindowStyleSheet()
{
    const QImage plain = shot();
    m_tree->setStyleSheet(QStringLiteral(" * {font-family:'KST';}"));
    QApplication::processEvents();
    const QImage styled = shot();
    // The rule under the header and the rows, the header's ground, the folder icon.
    for (const QPoint& point : {QPoint(790, 20), QPoint(700, 44 + ROW - 1), QPoint(54, 44 + ROW / 2)})
        QCOMPARE(styled.pixelColor(point), plain.pixelColor(point));
}

void tst_kstreeview_editing::operationFocusSurroundsTheEditedRow()
{
    Q_EMIT m_tree->editorEvent(m_model->index(2, 0));
    QImage image = m_area->grab().toImage();
    QCOMPARE(image.pixelColor(1, 2 * ROW + 1), QColor(0, 186, 230));
    m_tree->closeEditorState(m_tree->findChild<QLineEdit*>(), QAbstractItemDelegate::NoHint);
    image = m_area->grab().toImage();
    QVERIFY(image.pixelColor(1, 2 * ROW + 1) != QColor(0, 186, 230));
}

QTEST_MAIN(tst_kstreeview_editing)
#include "tst_kstreeview_editing.moc"
