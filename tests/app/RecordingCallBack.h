#pragma once

#include "app/EditContextController.h"
#include "messaging/ptc/CUnpack.h"

#include <QString>
#include <QStringList>

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

// The callback of a process that asks for a create session. The context owns it; the answers are stored
// outside and outlive it.
class RecordingCallBack : public ITitlerCallBack
{
public:
    explicit RecordingCallBack(Answers& answers) : mAnswers(answers) {}
    void finishTitlerCreateCallback(_CALLBACK_TITLER_PARAMTER param) override { mAnswers.add(param); }

private:
    Answers& mAnswers;
};
