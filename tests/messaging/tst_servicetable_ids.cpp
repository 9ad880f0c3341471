// Lists the ids of the methods on the wire again, since other programs are built with them: both ends of the
// other tests would make the same mistake.
#include "messaging/services/ServiceFamilies.h"
#include "messaging/services/TitlerAdapter.h"

#include <QtTest/QTest>

namespace
{

struct Row {
    const char* name;
    long id;
    long wanted;
};

#define ROW(service, method, wanted)                                                                         \
    Row                                                                                                      \
    {                                                                                                        \
#service "::" #method, service::METHOD_##method, wanted                                              \
    }

const Row ROWS[] = {
    ROW(APPEventFilterCallBackAdapter, setClientID, 1),
    ROW(APPEventFilterNotifyAdapter, postAPPEventFilterNotify, 1),
    ROW(APPEventFilterNotifyAdapter, postRestoreOriginalNotify, 2),
    ROW(APPEventFilterNotifyAdapter, postRestoreFocusNotify, 3),
    ROW(APPEventFilterRemoteProxy, postAPPEventFilter, 1),
    ROW(APPEventFilterRemoteProxy, postRestoreOriginal, 2),
    ROW(APPEventFilterRemoteProxy, postRestoreFocus, 3),
    ROW(APPEventFilterRemoteProxy, unregisterCallBack, 4),
    ROW(APPEventFilterRemoteProxy, unregisterNotify, 5),
    ROW(APPEventFilterRemoteProxy, registerCallBack, 6),
    ROW(APPEventFilterRemoteProxy, registerNotify, 7),
    ROW(FileManagerControllerCallBackAdapter, getClientID, 1),
    ROW(FileManagerControllerNotifyAdapter, importNotify, 1),
    ROW(FileManagerControllerNotifyAdapter, deleteNotify, 2),
    ROW(FileManagerControllerNotifyAdapter, renameTitlerTemplateNotify, 3),
    ROW(FileManagerControllerNotifyAdapter, updateTitlerFolderInFileManagerDelete, 4),
    ROW(FileManagerControllerNotifyAdapter, updateFolderNameInCurrentProjectNotify, 5),
    ROW(FileManagerControllerRemoteProxy, unregisterCallBack, 33),
    ROW(FileManagerControllerRemoteProxy, unregisterNotify, 34),
    ROW(FileManagerControllerRemoteProxy, updateTitlerStatus, 72),
    ROW(FileManagerControllerRemoteProxy, renameFolderStart, 73),
    ROW(FileManagerControllerRemoteProxy, updateTitlerFolderName, 74),
    ROW(FileManagerControllerRemoteProxy, titlerEditStatus, 75),
    ROW(FileManagerControllerRemoteProxy, titlerEditEndStatus, 76),
    ROW(FileManagerControllerRemoteProxy, updateTitlerOrder, 77),
    ROW(FileManagerControllerRemoteProxy, registerCallBack, 78),
    ROW(FileManagerControllerRemoteProxy, registerNotify, 79),
    ROW(MessageCenterCallBackAdapter, setClientID, 1),
    ROW(MessageCenterCallBackAdapter, getTopWindowCallBack, 2),
    ROW(MessageCenterNotifyAdapter, getTopWindowNotify, 1),
    ROW(MessageCenterNotifyAdapter, postMessageNotify, 2),
    ROW(MessageCenterNotifyAdapter, closeMessageNotify, 3),
    ROW(MessageCenterNotifyAdapter, showBarNotify, 4),
    ROW(MessageCenterRemoteProxy, setTopWindow, 1),
    ROW(MessageCenterRemoteProxy, getTopWindow, 2),
    ROW(MessageCenterRemoteProxy, postMessage, 3),
    ROW(MessageCenterRemoteProxy, closeMessage, 4),
    ROW(MessageCenterRemoteProxy, showBar, 5),
    ROW(MessageCenterRemoteProxy, unregisterCallBack, 6),
    ROW(MessageCenterRemoteProxy, unregisterNotify, 7),
    ROW(MessageCenterRemoteProxy, registerCallBack, 8),
    ROW(MessageCenterRemoteProxy, registerNotify, 9),
    ROW(PowerManagerCallBackAdapter, getClientID, 1),
    ROW(PowerManagerNotifyAdapter, powerOff, 1),
    ROW(PowerManagerNotifyAdapter, powerOn, 2),
    ROW(PowerManagerRemoteProxy, closeClient, 1),
    ROW(PowerManagerRemoteProxy, unregisterCallBack, 2),
    ROW(PowerManagerRemoteProxy, unregisterNotify, 3),
    ROW(PowerManagerRemoteProxy, inProcessing, 4),
    ROW(PowerManagerRemoteProxy, powerOff, 5),
    ROW(PowerManagerRemoteProxy, willPowerOff, 6),
    ROW(PowerManagerRemoteProxy, registerCallBack, 7),
    ROW(PowerManagerRemoteProxy, registerNotify, 8),
    ROW(ProjectDataManagerCallBackAdapter, getClientID, 1),
    ROW(ProjectDataManagerNotifyAdapter, loadNotify, 1),
    ROW(ProjectDataManagerRemoteProxy, unregisterCallBack, 7),
    ROW(ProjectDataManagerRemoteProxy, unregisterNotifyCallBack, 8),
    ROW(ProjectDataManagerRemoteProxy, registerCallBack, 9),
    ROW(ProjectDataManagerRemoteProxy, registerNotifyCallBack, 10),
    ROW(ShowTitlerControllerCallBackAdapter, showTitler, 1),
    ROW(ShowTitlerControllerRemoteProxy, setFolderStatus, 1),
    ROW(ShowTitlerControllerRemoteProxy, registerCallBack, 2),
    ROW(SoftKeyBoardControllerCallBackAdapter, sendInputString, 1),
    ROW(SoftKeyBoardControllerCallBackAdapter, sendInputStringOnEnterPressing, 2),
    ROW(SoftKeyBoardControllerCallBackAdapter, sendInputStringOnTextChanged, 3),
    ROW(SoftKeyBoardControllerCallBackAdapter, sendKey, 4),
    ROW(SoftKeyBoardControllerCallBackAdapter, sendInputStringSelectionPos, 5),
    ROW(SoftKeyBoardControllerCallBackAdapter, sendSoftKeyboardState, 6),
    ROW(SoftKeyBoardControllerRemoteProxy, show, 1),
    ROW(SoftKeyBoardControllerRemoteProxy, close, 2),
    ROW(SoftKeyBoardControllerRemoteProxy, dummyClose, 3),
    ROW(SoftKeyBoardControllerRemoteProxy, simpleClose, 4),
    ROW(SoftKeyBoardControllerRemoteProxy, sendKey, 5),
    ROW(SoftKeyBoardControllerRemoteProxy, sendLimitInfo, 6),
    ROW(SoftKeyBoardControllerRemoteProxy, closeLimitBalloon, 7),
    ROW(SoftKeyBoardControllerRemoteProxy, registerCallBack, 10),
    ROW(SoftKeyBoardControllerRemoteProxy, showMask, 8),
    ROW(SoftKeyBoardControllerRemoteProxy, hideMask, 9),
    ROW(SystemSetupManagerCallBackAdapter, getClientID, 1),
    ROW(SystemSetupManagerCallBackAdapter, getLanguageInfoCallBack, 2),
    ROW(SystemSetupManagerCallBackAdapter, getInformationCallBack, 3),
    ROW(SystemSetupManagerNotifyAdapter, setSystemLanguageNotify, 1),
    ROW(SystemSetupManagerNotifyAdapter, setInputLanguageNotify, 2),
    ROW(SystemSetupManagerRemoteProxy, getLanguageInfo, 1),
    ROW(SystemSetupManagerRemoteProxy, getInformation, 16),
    ROW(SystemSetupManagerRemoteProxy, unregisterCallBack, 62),
    ROW(SystemSetupManagerRemoteProxy, unregisterNotifyCallBack, 63),
    ROW(SystemSetupManagerRemoteProxy, registerCallBack, 64),
    ROW(SystemSetupManagerRemoteProxy, registerNotifyCallBack, 65),
    ROW(TitlerAdapter, showTitlerCreate, 1),
    ROW(TitlerAdapter, showTitlerEdit, 2),
    ROW(TitlerAdapter, showDialogMaskWidget, 3),
    ROW(TitlerAdapter, showMessageMaskWidget, 4),
    ROW(TitlerAdapter, registerCallBack, 5),
    ROW(TitlerCallBackRemoteProxy, finishTitlerCreateCallback, 1),
};

} // namespace

class tst_servicetable_ids : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void ids_data()
    {
        QTest::addColumn<long>("id");
        QTest::addColumn<long>("wanted");
        for (const Row& row : ROWS)
            QTest::newRow(row.name) << row.id << row.wanted;
    }
    void ids()
    {
        QFETCH(long, id);
        QFETCH(long, wanted);
        QCOMPARE(id, wanted);
    }
};

QTEST_GUILESS_MAIN(tst_servicetable_ids)
#include "tst_servicetable_ids.moc"
