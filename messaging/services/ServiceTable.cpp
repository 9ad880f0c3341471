#include "messaging/services/ServiceTable.h"

#include "messaging/services/IAPPEventFilter.h"
#include "messaging/services/IFileManagerController.h"
#include "messaging/services/IMessageCenter.h"
#include "messaging/services/IPowerManager.h"
#include "messaging/services/IProjectDataManager.h"
#include "messaging/services/IShowTitlerController.h"
#include "messaging/services/ISoftKeyBoardController.h"
#include "messaging/services/ISystemSetupManager.h"

#include <algorithm>
#include <array>

namespace ServiceTable
{

namespace
{

// The sender key of each client number, beginning with MAIN_CLIENT.
constexpr std::array<long, 9> SENDER_KEYS = {1, 2, 3, 4, 5, 6, 4, 7, 8};

template <typename Interface>
constexpr Service describe()
{
    return {Interface::INTERFACE_ID,
            Interface::NAME,
            SENDER_KEYS[Interface::CLIENT - MAIN_CLIENT],
            Interface::CLIENT,
            Interface::OPERATIONS,
            Interface::CALLBACK_ADAPTER_TYPE,
            Interface::NOTIFY_ADAPTER_TYPE};
}

// The services that this program calls are taken from their own tables.
constexpr std::array SERVICES = {
    describe<IAPPEventFilter>(),
    Service{4, "AudioAccessController", MAIN_CLIENT_KEY, MAIN_CLIENT, 27, 5, 6},
    Service{7, "AudioInputListController", MAIN_CLIENT_KEY, MAIN_CLIENT, 5, 8, NO_ADAPTER},
    Service{9, "AudioInstantStartController", MAIN_CLIENT_KEY, MAIN_CLIENT, 3, 10, NO_ADAPTER},
    Service{11, "AudioManager", MAIN_CLIENT_KEY, MAIN_CLIENT, 8, 12, NO_ADAPTER},
    Service{13, "AudioMixerController", MAIN_CLIENT_KEY, MAIN_CLIENT, 13, 14, 15},
    Service{16, "AudioSetupController", MAIN_CLIENT_KEY, MAIN_CLIENT, 19, 17, NO_ADAPTER},
    Service{18, "AuxManager", MAIN_CLIENT_KEY, MAIN_CLIENT, 14, 19, 20},
    Service{21, "CDCSIPCResponder", MAIN_CLIENT_KEY, MAIN_CLIENT, 3, 22, 23},
    Service{24, "CameraController", MAIN_CLIENT_KEY, MAIN_CLIENT, 7, 25, 26},
    Service{27, "CameraSsManager", MAIN_CLIENT_KEY, MAIN_CLIENT, 5, 28, NO_ADAPTER},
    Service{29, "CurrentStatusManager", MAIN_CLIENT_KEY, MAIN_CLIENT, 81, 30, NO_ADAPTER},
    Service{31, "EffectManager", MAIN_CLIENT_KEY, MAIN_CLIENT, 5, 32, NO_ADAPTER},
    Service{33, "EncodeParamManager", MAIN_CLIENT_KEY, MAIN_CLIENT, 8, 34, 35},
    describe<IFileManagerController>(),
    Service{41, "InputController", MAIN_CLIENT_KEY, MAIN_CLIENT, 6, 42, NO_ADAPTER},
    Service{43, "InputManager", MAIN_CLIENT_KEY, MAIN_CLIENT, 16, 44, 45},
    Service{46, "LogSender", MAIN_CLIENT_KEY, MAIN_CLIENT, 3, NO_ADAPTER, 47},
    Service{48, "LogoManager", MAIN_CLIENT_KEY, MAIN_CLIENT, 23, 49, 50},
    Service{53, "MediaFileManager", MAIN_CLIENT_KEY, MAIN_CLIENT, 22, 54, 55},
    Service{59, "MediaPlayController", MAIN_CLIENT_KEY, MAIN_CLIENT, 21, 60, 61},
    describe<IMessageCenter>(),
    Service{68, "NextVideoController", MAIN_CLIENT_KEY, MAIN_CLIENT, 51, 69, 70},
    describe<IPowerManager>(),
    Service{74, "ProjectController", MAIN_CLIENT_KEY, MAIN_CLIENT, 5, 75, NO_ADAPTER},
    describe<IProjectDataManager>(),
    Service{79, "ProjectManager", MAIN_CLIENT_KEY, MAIN_CLIENT, 3, 80, NO_ADAPTER},
    Service{81, "RecordingController", MAIN_CLIENT_KEY, MAIN_CLIENT, 20, 82, 83},
    Service{87, "RemoteDeviceController", MAIN_CLIENT_KEY, MAIN_CLIENT, 13, 88, 89},
    Service{90, "SceneManager", MAIN_CLIENT_KEY, MAIN_CLIENT, 19, 91, NO_ADAPTER},
    describe<IShowTitlerController>(),
    Service{94, "SnapShotController", MAIN_CLIENT_KEY, MAIN_CLIENT, 4, NO_ADAPTER, NO_ADAPTER},
    describe<ISoftKeyBoardController>(),
    Service{97, "SourceManager", MAIN_CLIENT_KEY, MAIN_CLIENT, 8, 98, NO_ADAPTER},
    Service{99, "StreamingController", MAIN_CLIENT_KEY, MAIN_CLIENT, 12, 100, 101},
    Service{105, "StreamingManager", MAIN_CLIENT_KEY, MAIN_CLIENT, 11, 106, NO_ADAPTER},
    Service{110, "SubPanelController", SUB_PANEL_CLIENT_KEY, SUB_PANEL_CLIENT, 54, NO_ADAPTER, 111},
    Service{112, "SystemSettingManager", MAIN_CLIENT_KEY, MAIN_CLIENT, 2, 113, NO_ADAPTER},
    describe<ISystemSetupManager>(),
    Service{119, "TitlerManager", MAIN_CLIENT_KEY, MAIN_CLIENT, 28, 120, 121},
    Service{122, "TransManager", MAIN_CLIENT_KEY, MAIN_CLIENT, 6, 123, NO_ADAPTER},
    Service{124, "UpdateManager", MAIN_CLIENT_KEY, MAIN_CLIENT, 13, 125, 126},
};
// clang-format on

bool isClient(long client)
{
    return client >= MAIN_CLIENT && client - MAIN_CLIENT < static_cast<long>(SENDER_KEYS.size());
}

} // namespace

std::span<const Service> services()
{
    return SERVICES;
}

const Service* findByInterface(long interfaceId)
{
    const auto found = std::ranges::find(SERVICES, interfaceId, &Service::interfaceId);
    return found != SERVICES.end() ? &*found : nullptr;
}

long senderKeyOf(long client)
{
    return isClient(client) ? SENDER_KEYS[static_cast<std::size_t>(client - MAIN_CLIENT)] : TITLER_CLIENT_KEY;
}

bool isSibling(long client)
{
    return isClient(client) && client != TITLER_CLIENT;
}

} // namespace ServiceTable
