#pragma once

#include "messaging/services/ITitler.h"

#include <QString>
#include <QStringList>
#include <memory>

// A titler without windows that records what it is asked for.
class FakeTitler : public ITitler
{
public:
    void registerCallBack(ITitlerCallBack* target) override
    {
        callBack.reset(target);
        calls.append(target != nullptr ? "registerCallBack" : "registerCallBack null");
    }
    void showTitlerCreate(_CALL_TITLER_TYPE type) override { calls.append(QString("create %1").arg(type)); }
    void showTitlerEdit(_SHOW_TITLER_PARAMTER p) override
    {
        calls.append(QString("edit %1 %2").arg(p.type).arg(QString::fromStdWString(p.path)));
    }
    void showDialogMaskWidget(bool show) override { calls.append(QString("dialog %1").arg(show)); }
    void showMessageMaskWidget(bool show) override { calls.append(QString("message %1").arg(show)); }

    QStringList calls;
    std::unique_ptr<ITitlerCallBack> callBack;
};
