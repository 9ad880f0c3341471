#pragma once

#include "canvas/MessageBoxController.h"

#include <QList>
#include <QMap>
#include <QPair>
#include <QString>
#include <utility>

// Replaces the service that shows message boxes as long as it exists: keeps what is posted. Make one at a
// time.
class FakeMessageBoxController : public MessageBoxController
{
public:
    FakeMessageBoxController()
    {
        s_current = this;
        setProvider([]() -> MessageBoxController* { return s_current; }, [] {});
    }
    ~FakeMessageBoxController() override
    {
        s_current = nullptr;
        setProvider(nullptr, nullptr);
    }

    void setFactory(TitlerToolFactory*) override {}
    void postMessage(MessageDef::Message_ID id) override { posted.append({int(id), QString()}); }
    void postMessage(MessageDef::Message_ID id, QString text) override { posted.append({int(id), text}); }
    void postMessage(MessageDef::Message_ID id, MessageDefine::_emBoxType, QString text) override
    {
        posted.append({int(id), text});
    }
    void setMessageMainWindow(QWidget*) override {}
    bool GetTitlerIsTop() override { return true; }
    QMap<QString, QString> getMapData() override { return {}; }
    void closeMessage(MessageDefine::_emCloseType) override {}

    // Returns the numbers and texts since the last call.
    QList<QPair<int, QString>> take() { return std::exchange(posted, {}); }
    // Returns the numbers of what is in posted.
    QList<int> ids() const
    {
        QList<int> numbers;
        for (const auto& message : posted)
            numbers.append(message.first);
        return numbers;
    }

    QList<QPair<int, QString>> posted;

private:
    inline static FakeMessageBoxController* s_current = nullptr;
};
