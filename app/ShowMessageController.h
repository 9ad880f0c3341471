#pragma once

#include <QMap>
#include <QPointer>
#include <QString>
#include <QWidget>

#include "app/ServiceLink.h"
#include "canvas/MessageBoxController.h"
#include "messaging/services/IMessageCenter.h"
#include "messaging/services/MessageDefine.h"

// The link to the message service, which shows the numbered message boxes above all windows, and the source
// of the service's requests for masks. Other folders use it through the MessageBoxController interface.
//
// GUI thread; only the creation of the instance is thread-safe.
class ShowMessageController : public MessageBoxController,
                              public IMessageCenterCallBack,
                              public IMessageCenterNotify
{
    Q_OBJECT

public:
    static ShowMessageController* getInstance();
    static void clearInstance();

    void setFactory(TitlerToolFactory* factory) override;

    // Sends a message; it is lost without a log entry when there is no link to the service.
    void postMessage(MessageDef::Message_ID id) override;
    void postMessage(MessageDef::Message_ID id, QString text) override;
    void postMessage(MessageDef::Message_ID id, MessageDefine::_emBoxType boxType, QString text) override;

    // Sets the window that has to be visible for requests for masks; null is ignored.
    void setMessageMainWindow(QWidget* window) override;
    bool GetTitlerIsTop() override;
    QMap<QString, QString> getMapData() override;
    void closeMessage(MessageDefine::_emCloseType type) override;

    void changeTopWindow(MessageDefine::_emTopWindow top);

    // Show a mask, if the main window is visible, or hide it, which is always possible.
    void showDialogOpacityWidget();
    void hideDialogOpacityWidget();
    void showMessageOpacityWidget();
    void hideMessageOpacityWidget();

    // Called with answers and notices of the service.
    void setClientID(int id) override;
    void getTopWindowCallBack(int) override {}
    void getTopWindowNotify(int top) override;
    void postMessageNotify(MessageDefine::_tagMessageParam param) override;
    void closeMessageNotify(MessageDefine::_tagCloseParam param) override;
    void showBarNotify(int) override {}

Q_SIGNALS:
    void signalsShowDialogMaskWidget(bool show);
    void signalsShowMessageMaskWidget(bool show);

private:
    ShowMessageController();
    ~ShowMessageController() override;

    bool mainWindowIsShown() const;

    static ShowMessageController* mInstance;

    int m_lastMessageId = -1;
    ServiceLink<IMessageCenter> m_link;
    QMap<QString, QString> m_mapData;
    QPointer<QWidget> m_mainWindow;
    bool m_titlerIsTop = false;
};
