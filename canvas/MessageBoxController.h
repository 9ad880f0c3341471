#pragma once

#include "messaging/services/MessageDefine.h"

#include <QMap>
#include <QObject>
#include <QString>

class QWidget;
class TitlerToolFactory;

// Shows numbered message boxes, whose texts and windows belong to the message service. The application
// installs the controller with setProvider(); until then getInstance() is null and callers continue without a
// message. GUI thread only.
class MessageBoxController : public QObject
{
    Q_OBJECT
public:
    using QObject::QObject;

    static MessageBoxController* getInstance();
    static void clearInstance();
    // Sets the functions of the provider. Either both are given, or both are null, which removes the
    // provider.
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
