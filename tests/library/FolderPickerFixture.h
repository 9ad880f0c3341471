#pragma once

#include "LibraryFixture.h"
#include "tests/support/Patience.h"
#include "tests/touchui/InputContextFixture.h"
#include "tests/touchui/TouchFixture.h"

#include "library/FolderEditor.h"
#include "library/FolderPicker.h"
#include "library/FolderPickerFactory.h"
#include "touchui/KSPushbutton.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSTreeView.h"

#include <QAbstractItemModelTester>
#include <QApplication>
#include <QDir>
#include <QSignalSpy>
#include <memory>

// The folder picker above a window, with fingers of a touch screen and a soft keyboard service that records
// its calls. Programs that use it call KSInputContext::install() before QApplication.
class FolderPickerFixture
{
public:
    static constexpr int HOLD = 30; // milliseconds

    // Removes all folders; opens nothing yet.
    void reset()
    {
        close();
        qunsetenv("K2SYS_FS_REMAIN");
        QDir(root()).removeRecursively();
        QDir().mkpath(root());
        messages.take();
        reports.take();
        titles.take();
        context.createNew = false;
    }

    // Opens the dialog with the folders that are on the disk.
    void open()
    {
        touch = std::make_unique<TouchFixture>();
        service = std::make_unique<FakeSoftKeyBoardController>();
        input()->setKeyBoardController(service.get());
        window = std::make_unique<QWidget>();
        window->resize(1920, 1080);
        window->show();
        picker = std::make_unique<FolderPicker>(window.get());
        tester = std::make_unique<QAbstractItemModelTester>(
            model(), QAbstractItemModelTester::FailureReportingMode::QtTest);
        tree()->touch()->setHoldInterval(HOLD);
        picker->updateTreeView();
        picker->show();
        QVERIFY(QTest::qWaitForWindowExposed(picker.get(), PATIENCE_MS));
        picker->activateWindow();
        QVERIFY(QTest::qWaitForWindowActive(picker.get(), PATIENCE_MS));
    }

    void close()
    {
        tester.reset();
        picker.reset();
        window.reset();
        if (input())
            input()->setKeyBoardController(nullptr);
        KSInputContext::m_bClosed = true;
        KSInputContext::resetFocusWidget();
        KSInputContext::m_strLimitCondition.clear();
        service.reset();
        touch.reset();
    }

    // --- Disk

    QString root() const { return files.titleRoot(); }
    QString path(const QString& name) const { return root() + QLatin1Char('/') + name; }
    QStringList folders() const
    {
        return QDir(root()).entryList(QDir::Dirs | QDir::NoDotAndDotDot, QDir::Name);
    }
    void make(const QString& name, const QStringList& stems = {})
    {
        const QString folder = files.makeFolder(name);
        if (!stems.isEmpty())
            LibraryFixture::fillFolder(folder, stems);
    }

    // --- Tree

    KSTreeView* tree() const { return picker->treeView(); }
    KSTreeModel* model() const { return picker->treeModel(); }
    QModelIndex row(const QString& name, const QModelIndex& parent = QModelIndex()) const
    {
        for (int i = 0; i < model()->rowCount(parent); ++i)
            if (model()->index(i, 0, parent).data().toString() == name)
                return model()->index(i, 0, parent);
        return {};
    }
    QStringList names(const QModelIndex& parent = QModelIndex()) const
    {
        QStringList found;
        for (int i = 0; i < model()->rowCount(parent); ++i)
            found.append(model()->index(i, 0, parent).data().toString());
        return found;
    }
    QString current() const { return tree()->currentIndex().siblingAtColumn(0).data().toString(); }
    bool isEditable(const QString& name) const { return row(name).data(34).toBool(); }
    QPoint place(const QModelIndex& index) const { return tree()->visualRect(index).center(); }

    // --- Fingers

    // Taps in coordinates of the picker, since the dialog is larger than the screen of a test.
    void tap(const QWidget* widget, const QPoint& point) const
    {
        touch->tap(picker.get(), widget->mapTo(picker.get(), point));
    }
    void tap(const QModelIndex& index) const
    {
        QVERIFY(index.isValid());
        tap(tree()->viewport(), place(index));
    }
    void tap(const QString& name) const { tap(row(name)); }
    void tapButton(const char* name) const
    {
        QWidget* widget = button(name);
        QVERIFY(widget);
        tap(widget, widget->rect().center());
    }
    void hold(const QModelIndex& index) const
    {
        QVERIFY(index.isValid());
        QSignalSpy held(tree()->touch(), &TreeTouch::pressedAndHeld);
        const QPoint point = tree()->viewport()->mapTo(picker.get(), place(index));
        touch->press(picker.get(), point);
        QTRY_COMPARE(held.count(), 1);
        touch->lift(picker.get(), point);
    }
    void hold(const QString& name) const { hold(row(name)); }

    KSPushbutton* button(const char* name) const
    {
        return picker->findChild<KSPushbutton*>(QLatin1String(name));
    }
    // Returns the state of Duplicate, New Folder, Open and Cancel, one character each: "+" enabled, "-"
    // disabled.
    QString buttons() const
    {
        QString states;
        for (const char* name :
             {"duplicateFolderButton", "newFolderButton", "openFolderButton", "cancelFolderButton"})
            states += button(name)->isEnabled() ? QLatin1Char('+') : QLatin1Char('-');
        return states;
    }

    // --- Soft keyboard

    static KSInputContext* input() { return KSInputContext::instance(); }
    void enter() const
    {
        input()->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_Enter));
        QCoreApplication::processEvents();
    }
    // Enters a name as the soft keyboard does: the whole text, then the key.
    void enter(const QString& name) const
    {
        input()->sendInputStringOnEnterPressing(name.toStdWString());
        enter();
    }
    // Types on a physical keyboard, whose keys also go to the service and come back from it.
    void type(const QString& text) const
    {
        for (const QChar sign : text)
            input()->sendKey(keyRecord(QEvent::KeyPress, 0, QString(sign).toStdWString()));
    }
    void closeKeyboard() const { input()->sendKey(keyRecord(KSInputContext::SoftKeyBoardCloseType, 0)); }
    void escape() const
    {
        input()->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_Escape));
        QCoreApplication::processEvents();
    }
    // Returns the codes of the limit messages since the last call.
    QList<int> limits() const
    {
        QList<int> codes;
        for (const auto& info : std::exchange(service->limits, {}))
            codes.append(info.code);
        return codes;
    }
    // Answers the message about a name in use.
    void answerClash() const
    {
        MessageDefine::tagCloseParam param;
        param.messageId = MessageDef::MESSAGE_RENAME_FAILED;
        Q_EMIT MessageBoxController::getInstance()->signalCloseMessage(param);
    }

    LibraryFixture files;
    FakeMessageBoxController messages;
    FakeTitlerFolderReporter reports;
    FakeTitleChangeReporter titles;
    FakeEditContext context;
    std::unique_ptr<TouchFixture> touch;
    std::unique_ptr<FakeSoftKeyBoardController> service;
    std::unique_ptr<QWidget> window;
    std::unique_ptr<FolderPicker> picker;
    std::unique_ptr<QAbstractItemModelTester> tester;
};
