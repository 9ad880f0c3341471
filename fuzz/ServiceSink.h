#pragma once

#include "messaging/services/IAPPEventFilter.h"
#include "messaging/services/IFileManagerController.h"
#include "messaging/services/IMessageCenter.h"
#include "messaging/services/IPowerManager.h"
#include "messaging/services/IProjectDataManager.h"
#include "messaging/services/IShowTitlerController.h"
#include "messaging/services/ISoftKeyBoardController.h"
#include "messaging/services/ISystemSetupManager.h"
#include "messaging/services/ITitler.h"

#include <memory>
#include <numeric>
#include <string>

// Accepts the calls of all services: reads every string and keeps nothing.
class ServiceSink : public ITitler,
                    public IAPPEventFilterCallBack,
                    public IAPPEventFilterNotify,
                    public IFileManagerControllerCallBack,
                    public IFileManagerControllerNotify,
                    public IMessageCenterCallBack,
                    public IMessageCenterNotify,
                    public IPowerManagerCallBack,
                    public IPowerManagerNotify,
                    public IProjectDataManagerCallBack,
                    public IProjectDataManagerNotify,
                    public IShowTitlerControllerCallBack,
                    public ISoftKeyBoardControllerCallBack,
                    public ISystemSetupManagerCallBack,
                    public ISystemSetupManagerNotify
{
public:
    void registerCallBack(ITitlerCallBack* target) override { mCallBack.reset(target); }
    void showTitlerCreate(_CALL_TITLER_TYPE) override { ++mCalls; }
    void showTitlerEdit(_SHOW_TITLER_PARAMTER p) override { see(p.path); }
    void showDialogMaskWidget(bool) override { ++mCalls; }
    void showMessageMaskWidget(bool) override { ++mCalls; }

    void setClientID(int) override { ++mCalls; }
    void getClientID(int) override { ++mCalls; }
    void postAPPEventFilterNotify(APPEventDefine::_tagAPPEvent) override { ++mCalls; }
    void postRestoreOriginalNotify(APPEventDefine::_tagAPPEvent) override { ++mCalls; }
    void postRestoreFocusNotify() override { ++mCalls; }
    void importNotify(FileManagerDefine::tagImportNotify p) override
    {
        see(p.path);
        for (const std::wstring& text : p.strings)
            see(text);
    }
    void deleteNotify(FileManagerDefine::tagDeleteNotify p) override { see(p.path); }
    void renameTitlerTemplateNotify(FileManagerDefine::tagRenameNotify p) override
    {
        for (const std::wstring& text : p.strings)
            see(text);
    }
    void updateTitlerFolderInFileManagerDelete(std::wstring name) override { see(name); }
    void updateFolderNameInCurrentProjectNotify(FileManagerDefine::tagChangeFolderNameParam p) override
    {
        see(p.oldPath);
        see(p.newPath);
    }
    void getTopWindowCallBack(int) override { ++mCalls; }
    void getTopWindowNotify(int) override { ++mCalls; }
    void postMessageNotify(MessageDefine::_tagMessageParam p) override
    {
        see(p.first);
        see(p.text);
    }
    void closeMessageNotify(MessageDefine::_tagCloseParam) override { ++mCalls; }
    void showBarNotify(int) override { ++mCalls; }
    void powerOff() override { ++mCalls; }
    void powerOn() override { ++mCalls; }
    void loadNotify(int) override { ++mCalls; }
    void showTitler() override { ++mCalls; }
    void sendInputString(std::wstring text) override { see(text); }
    void sendInputStringOnEnterPressing(std::wstring text) override { see(text); }
    void sendInputStringOnTextChanged(std::wstring text) override { see(text); }
    void sendKey(SubCommonDefine::tagSoftKeyBoardKeyData key) override { see(key.text); }
    void sendInputStringSelectionPos(SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos) override
    {
        ++mCalls;
    }
    void sendSoftKeyboardState(bool) override { ++mCalls; }
    void getLanguageInfoCallBack(SystemSetupDef::tagSystemLanguageParam) override { ++mCalls; }
    void getInformationCallBack(SystemSetupDef::tagSystemInformation) override { ++mCalls; }
    void setSystemLanguageNotify(int) override { ++mCalls; }
    void setInputLanguageNotify(int) override { ++mCalls; }

    long calls() const { return mCalls; }

private:
    void see(const std::wstring& text)
    {
        ++mCalls;
        mSum = std::accumulate(text.begin(), text.end(), mSum, [](unsigned long sum, wchar_t sign) {
            return sum * 31 + static_cast<unsigned>(sign);
        });
    }

    long mCalls = 0;
    unsigned long mSum = 0;
    std::unique_ptr<ITitlerCallBack> mCallBack;
};
