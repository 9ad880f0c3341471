#include "bench/ClosingWindow.h"

#include "app/APPEventFilter.h"
#include "app/TitlerWindow.h"
#include "bench/BenchEnvironment.h"
#include "bench/BenchTitles.h"
#include "bench/PeerProcess.h"
#include "canvas/CanvasScene.h"
#include "document/ArchiveController.h"
#include "library/ArchiveList.h"
#include "messaging/ptc/SocketRemoteReceiver.h"
#include "support/FileSyncQueue.h"
#include "support/HeapPolicy.h"
#include "support/IPathManagerEx.h"
#include "touchui/KSInputContext.h"

#include <QApplication>
#include <QDeadlineTimer>
#include <QDir>
#include <QElapsedTimer>
#include <chrono>
#include <cstdio>
#include <iostream>
#include <memory>
#include <string>
#include <unistd.h>

// Outside the namespace, since the macro declares functions.
static void loadPictures()
{
    Q_INIT_RESOURCE(TitlerToolResource);
    Q_INIT_RESOURCE(UILibrary);
}

namespace
{

constexpr int TEXTS = 4;
constexpr int CHARACTERS = 24;
constexpr int CHARACTER_SIZE = 96;
constexpr int SHOW_TIME = 60000; // milliseconds
constexpr std::chrono::seconds SYNC_TIME(10);

// Accepts the connections of one sibling process.
std::unique_ptr<SocketRemoteReceiver> sibling(long client)
{
    auto receiver = std::make_unique<SocketRemoteReceiver>(0);
    return receiver->initialize(client) ? std::move(receiver) : nullptr;
}

// Creates what the titler needs on the appliance, and a folder of one title. Returns an empty path when that
// fails.
QString makeFolder()
{
    PeerProcess provision;
    if (!provision.start(BenchEnvironment::binaryFolder() + QStringLiteral("/titler_provision")) ||
        !provision.finished(SHOW_TIME))
        return {};
    const QString folder = QString::fromStdWString(IPathManagerEx::getInstance()->getTitleResourcesPath()) +
                           QStringLiteral("/Closing");
    QDir().mkpath(folder);
    const std::string path = BenchTitles::writeFolder(folder.toStdString(), 1).front();
    Archive title = BenchTitles::title(path, CHARACTERS, CHARACTER_SIZE, TEXTS);
    ArchiveController().saveNewArchive(folder, &title);
    return folder;
}

// Returns a stream to the standard output. What the program itself prints goes to the standard error from now
// on.
FILE* takeOutput()
{
    FILE* output = fdopen(dup(STDOUT_FILENO), "w");
    dup2(STDERR_FILENO, STDOUT_FILENO);
    return output;
}

// Opens the folder and closes it with a changed title. Returns the time of closing; -1 when the window does
// not show or close.
qint64 closeChangedTitle(TitlerWindow& window, const QString& folder)
{
    window.showTitlerWindow({_titler_paramter::CREATE_OR_EDIT, folder.toStdWString()});
    auto* scene = window.findChild<CanvasScene*>();
    const QDeadlineTimer limit(SHOW_TIME);
    while (scene->getTextItemList().size() != TEXTS && !limit.hasExpired())
        QCoreApplication::processEvents();
    QCoreApplication::processEvents();
    FileSyncQueue::flush(SYNC_TIME);
    if (limit.hasExpired())
        return -1;
    scene->saveArchiveFlag(); // marks the title as changed
    QElapsedTimer timer;
    timer.start();
    window.closeTitlerWindow();
    const qint64 time = timer.nsecsElapsed();
    return window.isHidden() ? time : -1;
}

} // namespace

int ClosingWindow::run(int argc, char* argv[])
{
    FILE* output = takeOutput();
    HeapPolicy::keepFlat();
    KSInputContext::install();
    QApplication application(argc, argv);
    QApplication::setQuitOnLastWindowClosed(false);
    APPEventFilter::instance();
    loadPictures();
    const auto mainProcess = sibling(1000);
    const auto subPanel = sibling(1002);
    if (!mainProcess || !subPanel)
        return 1;
    const QString folder = makeFolder();
    if (folder.isEmpty())
        return 1;
    auto window = std::make_unique<TitlerWindow>(true, nullptr);
    pMainWindow = window.get();
    window->setRealClose(false);
    std::fputs("ready\n", output);
    std::fflush(output);
    for (std::string line; std::getline(std::cin, line);) {
        std::fprintf(output, "%lld\n", static_cast<long long>(closeChangedTitle(*window, folder)));
        std::fflush(output);
    }
    window.reset();
    pMainWindow = nullptr;
    APPEventFilter::release();
    return 0;
}
