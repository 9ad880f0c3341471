#pragma once

#include "messaging/ptc/CUnpack.h"
#include "messaging/services/ITitler.h"

#include <QString>
#include <QStringList>
#include <functional>
#include <utility>

// The answers of a process that asked for new titles.
struct Answers {
    void add(const _CALLBACK_TITLER_PARAMTER& param)
    {
        ++calls;
        last = param;
        paths.clear();
        const unsigned char* at = param.data;
        for (int i = 0; i < param.count; ++i) {
            unpack_info_t info;
            const auto used = CUnpack::unpack(&info, const_cast<unsigned char*>(at));
            paths << QString::fromUtf8(reinterpret_cast<const char*>(info.raw));
            at += used;
        }
        bytesRead = static_cast<int>(at - param.data);
    }

    int calls = 0;
    int bytesRead = 0;
    _CALLBACK_TITLER_PARAMTER last;
    QStringList paths;
};

// The callback of a process that asks for new titles. Who it is registered at owns it; the answers are handed
// to the test, whose objects outlive it.
class FakeTitlerCallBack : public ITitlerCallBack
{
public:
    using Taker = std::function<void(const _CALLBACK_TITLER_PARAMTER&)>;

    explicit FakeTitlerCallBack(Taker taker) : m_taker(std::move(taker)) {}
    explicit FakeTitlerCallBack(Answers& answers)
        : m_taker([&answers](const _CALLBACK_TITLER_PARAMTER& param) { answers.add(param); })
    {
    }
    void finishTitlerCreateCallback(_CALLBACK_TITLER_PARAMTER param) override { m_taker(param); }

private:
    Taker m_taker;
};
