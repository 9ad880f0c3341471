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
    void registerCallBack(ITitlerCallBack* target) override { m_callBack.reset(target); }
    void showTitlerCreate(_CALL_TITLER_TYPE) override { ++m_calls; }
    void showTitlerEdit(_SHOW_TITLER_PARAMTER p) override { see(p.path); }
    void showDialogMaskWidget(bool) override { ++m_calls; }
    void showMessageMaskWidget(bool) override { ++m_calls; }

    void setClientID(int) override { ++m_calls; }
    void getClientID(int) override { ++m_calls; }
    void postAPPEventFilterNotify(APPEventDefine::_tagAPPEvent) override { ++m_calls; }
    void postRestoreOriginalNotify(APPEventDefine::_tagAPPEvent) override { ++m_calls; }
    void postRestoreFocusNotify() override { ++m_calls; }
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
    void getTopWindowCallBack(int) override { ++m_calls; }
    void getTopWindowNotify(int) override { ++m_calls; }
    void postMessageNotify(MessageDefine::_tagMessageParam p) override
    {
        see(p.first);
        see(p.text);
    }
    void closeMessageNotify(MessageDefine::_tagCloseParam) override { ++m_calls; }
    void showBarNotify(int) override { ++m_calls; }
    void powerOff() override { ++m_calls; }
    void powerOn() override { ++m_calls; }
    void loadNotify(int) override { ++m_calls; }
    void showTitler() override { ++m_calls; }
    void sendInputString(std::wstring text) override { see(text); }
    void sendInputStringOnEnterPressing(std::wstring text) override { see(text); }
    void sendInputStringOnTextChanged(std::wstring text) override { see(text); }
    void sendKey(SubCommonDefine::tagSoftKeyBoardKeyData key) override { see(key.text); }
    void sendInputStringSelectionPos(SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos) override
    {
        ++m_calls;
    }
    void sendSoftKeyboardState(bool) override { ++m_calls; }
    void getLanguageInfoCallBack(SystemSetupDef::tagSystemLanguageParam) override { ++m_calls; }
    void getInformationCallBack(SystemSetupDef::tagSystemInformation) override { ++m_calls; }
    void setSystemLanguageNotify(int) override { ++m_calls; }
    void setInputLanguageNotify(int) override { ++m_calls; }

    long calls() const { return m_calls; }

private:
    void see(const std::wstring& text)
    {
        ++m_calls;
        m_sum = std::accumulate(text.begin(), text.end(), m_sum, [](unsigned long sum, wchar_t sign) {
            return sum * 31 + static_cast<unsigned>(sign);
        });
    }

    long m_calls = 0;
    unsigned long m_sum = 0;
    std::unique_ptr<ITitlerCallBack> m_callBack;
};
