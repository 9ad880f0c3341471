#pragma once

#include "messaging/services/MessageDefine.h"

#include <QMap>
#include <QObject>
#include <QString>

class QWidget;
class TitlerToolFactory;

// Shows numbered message boxes, whose texts and windows live in the message service. The application installs
// the controller by setProvider; until then getInstance() is null and callers go on without a message. GUI
// thread only.
class MessageBoxController : public QObject
{
    Q_OBJECT
public:
    using QObject::QObject;

    static MessageBoxController* getInstance();
    static void clearInstance();
    // Neither function may be null once one is given; both null removes the provider.
    static void setProvider(MessageBoxController* (*get)(), void (*clear)());

public Q_SLOTS:
    virtual void setFactory(TitlerToolFactory* factory) = 0;
    virtual void postMessage(MessageDef::Message_ID id) = 0;
    virtual void postMessage(MessageDef::Message_ID id, QString text) = 0;
    virtual void postMessage(MessageDef::Message_ID id, MessageDefine::_emBoxType type, QString text) = 0;
    virtual void setMessageMainWindow(QWidget* window) = 0;
    virtual bool GetTitlerIsTop() = 0;
    virtual QMap<QString, QString> getMapData() = 0;
    virtual void closeMessage(MessageDefine::_emCloseType type) = 0;

Q_SIGNALS:
    void signalShowMessage(MessageDefine::_emBoxType type, MessageDefine::_tagMessageParam param);
    void signalCloseMessage(MessageDefine::_tagCloseParam param);
};
