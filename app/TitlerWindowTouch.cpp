// Events, move mode, masks and language of the window.
#include "app/TitlerWindow.h"

#include "app/TitlerAPPEventFilterController.h"
#include "app/ToolsBar.h"
#include "canvas/CanvasScene.h"
#include "canvas/GraphicsView.h"
#include "library/ArchiveList.h"
#include "library/FolderPicker.h"
#include "library/TemplatePicker.h"
#include "panel/TextToolsPanel.h"
#include "support/LogManager.h"
#include "support/SystemInfo.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSPushbutton.h"

#include <QApplication>
#include <QDebug>
#include <QInputMethodEvent>
#include <QMenu>
#include <QMouseEvent>
#include <QPalette>
#include <QSlider>
#include <QTouchEvent>
#include <QTranslator>

namespace
{

constexpr QColor MASK_COLOR(0, 0, 0, 166);

bool isGraphicsView(const QWidget* widget)
{
    // The point may lie on the view's viewport.
    for (; widget; widget = widget->parentWidget()) {
        if (qobject_cast<const QGraphicsView*>(widget))
            return true;
    }
    return false;
}

} // namespace

void TitlerWindow::slotDeleteEmptyItems()
{
    // Over the canvas lies the viewport of its view: a tap beside a text that was left empty takes that away.
    if (!qobject_cast<QGraphicsView*>(QApplication::widgetAt(QCursor::pos())))
        mCanvasScene->slotDeleteEmptyItems();
}

void TitlerWindow::mousePressEvent(QMouseEvent* event)
{
    QWidget* child = childAt(mapFromGlobal(QCursor::pos()));
    QString places;
    QDebug(&places) << "#POS#:" << child << QCursor::pos() << event->position() << event->globalPosition();
    LOG_DEBUG_OPERATE(L"TitlerWindow", 200, places.toStdWString());
    if (TEXT_PROPERTY_RECT.contains(mapFromGlobal(event->globalPosition().toPoint()))) {
        QMainWindow::mousePressEvent(event);
        QMainWindow::mousePressEvent(event);
        return;
    }
    if (!isGraphicsView(child))
        hideSoftWareWithDeleteEmptyItems();
    QMainWindow::mousePressEvent(event);
}

bool TitlerWindow::eventFilter(QObject* obj, QEvent* event)
{
    if (mArchiveList->getMoveState())
        return false;
    if (ignoreMouseAndTouchEventWhenArchiveListIsMoveMode(obj, event))
        return true;
    switch (event->type()) {
    case QEvent::MouseButtonPress:
    case QEvent::TouchBegin:
        if (qobject_cast<QMenu*>(obj))
            return false;
        mArchiveList->clearOperationItemState(mArchiveList->getCurrentOperationArchive());
        break;
    case QEvent::MouseButtonRelease:
        if (obj == mArchiveList)
            hideSoftWareWithOutDeleteEmptyItems();
        break;
    default:
        break;
    }
    return ignoreTouchEventWhenSliderIsShowing(obj, event);
}

// While the slider of the edge is open, fingers work nothing else.
bool TitlerWindow::ignoreTouchEventWhenSliderIsShowing(QObject* obj, QEvent* event) const
{
    switch (event->type()) {
    case QEvent::TouchBegin:
    case QEvent::TouchUpdate:
    case QEvent::TouchEnd:
        return obj && !qobject_cast<QSlider*>(obj) && mTextToolsPanel->edgeSliderIsShown();
    default:
        return false;
    }
}

bool TitlerWindow::ignoreMouseAndTouchEventWhenArchiveListIsMoveMode(QObject* obj, QEvent* event)
{
    if (!archiveListIsMoveMode() || obj == mMoveButton)
        return false;
    QPoint global;
    switch (event->type()) {
    case QEvent::MouseButtonDblClick:
    case QEvent::MouseButtonPress:
    case QEvent::Wheel:
        global = static_cast<QSinglePointEvent*>(event)->globalPosition().toPoint();
        break;
    case QEvent::TouchBegin: {
        const auto& points = static_cast<QTouchEvent*>(event)->points();
        if (points.isEmpty())
            return false;
        global = points.first().globalPosition().toPoint();
        break;
    }
    default:
        return false;
    }
    // A press on the button is seen first at the window that holds it.
    const QRect button(mMoveButton->mapToGlobal(QPoint(0, 0)), mMoveButton->size());
    const QRect list(mArchiveList->mapToGlobal(QPoint(0, 0)), mArchiveList->size());
    if (list.contains(global) || button.contains(global))
        return false;
    slotCancelArchiveListMoveMode();
    if (event->type() == QEvent::TouchBegin)
        slotCancelArchiveListMoveMode(); // siblings hear of a finger twice
    return true;
}

bool TitlerWindow::archiveListIsMoveMode() const
{
    return !m_bMoveModeOff;
}

void TitlerWindow::editAndDoneButtonClicked()
{
    // What is being composed goes into the text before that is left.
    if (mInputContext)
        mInputContext->sendEvent(QInputMethodEvent());
    mMoveButton->setStyleSheet(mMoveButton->styleSheet());
    sendTransientControlEvent(m_bMoveModeOff);
    changeMoveMode(m_bMoveModeOff);
}

void TitlerWindow::changeMoveMode(bool on)
{
    mMoveButton->setText(on ? tr("Done") : tr("Move"));
    mMoveButton->changeButtonState(on ? KSPushbutton::ButtonSelectedRest : KSPushbutton::ButtonRest);
    mMoveButton->setSelected(on);
    m_bMoveModeOff = !on;
    Q_EMIT moveButtonClicked(on);
}

void TitlerWindow::slotChangeDoneToMoveMode()
{
    if (archiveListIsMoveMode())
        editAndDoneButtonClicked();
}

void TitlerWindow::slotCancelArchiveListMoveMode()
{
    reportHiddenControl();
    changeMoveMode(false);
}

void TitlerWindow::moveButtonPressed()
{
    mMoveButton->changeButtonState(mMoveButton->isSelected() ? KSPushbutton::ButtonSelectedPressed
                                                             : KSPushbutton::ButtonPressed);
}

void TitlerWindow::moveButtonReleased()
{
    mMoveButton->changeButtonState(mMoveButton->isSelected() ? KSPushbutton::ButtonSelectedRest
                                                             : KSPushbutton::ButtonRest);
}

// Tells the siblings that a control which closes on a press elsewhere is open, or closed again.
void TitlerWindow::sendTransientControlEvent(bool on)
{
    if (mTitlerAPPEventFilterController)
        mTitlerAPPEventFilterController->sendAPPEvent(APPEventDefine::LOCKTYPE_OBJECT, on);
}

void TitlerWindow::reportHiddenControl()
{
    if (WINDOW_IS_SHOWN)
        sendTransientControlEvent(false);
}

void TitlerWindow::slotShowEdgeSlider(bool isShow)
{
    sendTransientControlEvent(isShow);
}

void TitlerWindow::slotShowCanvasMenu(bool isShow)
{
    sendTransientControlEvent(isShow);
}

void TitlerWindow::slotShowFontFamilyComboxList(bool isShow)
{
    sendTransientControlEvent(isShow);
}

void TitlerWindow::slotShowFontSizeComboxList(bool isShow)
{
    sendTransientControlEvent(isShow);
}

void TitlerWindow::slotHideEdgeSlider()
{
    mTextToolsPanel->hideEdgeSlider();
    reportHiddenControl();
}

void TitlerWindow::slotHideCanvasMenu()
{
    mToolsBar->hideCanvasMenu();
    reportHiddenControl();
}

void TitlerWindow::slotHideFontFamilyComboxList()
{
    mTextToolsPanel->hideFontFamilyComboxList();
    reportHiddenControl();
}

void TitlerWindow::slotHideFontSizeComboxList()
{
    mTextToolsPanel->hideFontSizeComboxList();
    reportHiddenControl();
}

QWidget* TitlerWindow::createMask() const
{
    auto* mask = new QWidget;
    mask->setFocusPolicy(Qt::NoFocus);
    QPalette maskPalette;
    maskPalette.setColor(QPalette::Window, MASK_COLOR);
    mask->setPalette(maskPalette);
    mask->setAutoFillBackground(true);
    return mask;
}

void TitlerWindow::slotShowDialogMaskWidget(bool isShow)
{
    showDialogMaskWidget(isShow);
}

void TitlerWindow::slotShowMessageMaskWidget(bool isShow)
{
    showMessageMaskWidget(isShow);
}

void TitlerWindow::showDialogMaskWidget(bool show)
{
    if (show && !WINDOW_IS_SHOWN)
        return;
    if (!mDialogMask && show) {
        mDialogMask = createMask();
        mDialogMask->setParent(this);
        mDialogMask->setGeometry(rect());
        mDialogMask->raise();
    }
    if (mDialogMask)
        mDialogMask->setVisible(show);
    setAttribute(Qt::WA_AcceptTouchEvents, !show);
    if (!show || mTextToolsPanel->colorPaletteIsShown())
        mTextToolsPanel->showDialogMaskWidget(show);
    if (!show || (mTemplatePicker->isVisible() && !mTextToolsPanel->colorPaletteIsShown()))
        mTemplatePicker->showDialogMaskWidget(show);
    if (!show || (mFolderPicker->isVisible() && !mTemplatePicker->isVisible() &&
                  !mTextToolsPanel->colorPaletteIsShown()))
        mFolderPicker->showDialogMaskWidget(show);
}

void TitlerWindow::showMessageMaskWidget(bool show)
{
    if (show && !WINDOW_IS_SHOWN)
        return;
    if (!mMessageMask && show) {
        mMessageMask = createMask();
        mMessageMask->setParent(this);
        mMessageMask->setGeometry(rect());
        mMessageMask->raise();
    }
    if (mMessageMask)
        mMessageMask->setVisible(show);
    const bool isDialogMasked = mDialogMask && !mDialogMask->isHidden();
    setAttribute(Qt::WA_AcceptTouchEvents, !show && !isDialogMasked);
    if (!show || mTextToolsPanel->colorPaletteIsShown())
        mTextToolsPanel->showMessageMaskWidget(show);
    if (!show || (mTemplatePicker->isVisible() && !mTextToolsPanel->colorPaletteIsShown()))
        mTemplatePicker->showMessageMaskWidget(show);
    if (!show || (mFolderPicker->isVisible() && !mTemplatePicker->isVisible() &&
                  !mTextToolsPanel->colorPaletteIsShown()))
        mFolderPicker->showMessageMaskWidget(show);
}

void TitlerWindow::slotSystemLanguageChanged(SystemSetupDef::emSystemLanguageType systemLanguage)
{
    switchTranslator(systemLanguage);
    useSpecifiedFont(systemLanguage);
    mTemplatePicker->reloadTemplates(systemLanguage);
}

void TitlerWindow::slotInputLanguageChanged(SystemSetupDef::emInputLanguageType inputLanguage)
{
    mCanvasScene->slotSceneInputLanguageChanged(inputLanguage);
    mTextToolsPanel->displayInputLanguage(inputLanguage);
}

void TitlerWindow::slotGetModuleInfo(SystemSetupDef::emInformationModel moduleInfo)
{
    m_emModuleInfo = moduleInfo;
    mCanvasScene->setModuleInfo(moduleInfo);
    mTextToolsPanel->setModuleInfo(moduleInfo);
    mTemplatePicker->setModuleInfo(moduleInfo);
}

void TitlerWindow::switchTranslator(SystemSetupDef::emSystemLanguageType type)
{
    if (!mTranslator) {
        mTranslator = new QTranslator(qApp);
        m_strTranslationPath = QString::fromStdWString(SystemInfo::getInstance()->getPrefixPath()) +
                               QStringLiteral("/share/kestrel/translations/titler/");
    }
    const QString file =
        type == SystemSetupDef::emSystemLanguageChinese ? QStringLiteral("cn.qm") : QStringLiteral("en.qm");
    // Loading empties the translator first, also when it fails: the language of before has to stay.
    if (QTranslator probe;
        !probe.load(m_strTranslationPath + file) || !mTranslator->load(m_strTranslationPath + file))
        return;
    QCoreApplication::installTranslator(mTranslator);
    retranslateUI();
}

void TitlerWindow::retranslateUI()
{
    setWindowTitle(tr("Titler"));
    mMoveButton->setText(archiveListIsMoveMode() ? tr("Done") : tr("Move"));
    mTextToolsPanel->translateText();
    mToolsBar->translateText();
    mFolderPicker->translateText();
    mArchiveList->translateText();
    mTemplatePicker->translateText();
}

void TitlerWindow::useSpecifiedFont(SystemSetupDef::emSystemLanguageType type)
{
    const QString family =
        type == SystemSetupDef::emSystemLanguageChinese ? QStringLiteral("DFHeiW5-A") : QStringLiteral("KST");
    mFolderPicker->setSystemLanFont(QFont(family));
    setStyleSheet(QStringLiteral(" * {font-family:'%1';}").arg(family));
    mArchiveList->setSystemLanFont(family);
    mTemplatePicker->setSystemLanFont(QFont(family));
}

void TitlerWindow::changeFontComboxItem(SystemSetupDef::emInformationModel moduleInfo)
{
    Q_EMIT modifyFontComboxItem(moduleInfo != SystemSetupDef::emInformationModelChina);
}
