#include "app/APPEventFilter.h"
#include "app/TitlerWindow.h"
#include "support/DataPathCheck.h"
#include "support/DescriptorLimit.h"
#include "support/FileSyncQueue.h"
#include "support/HeapPolicy.h"
#include "support/LeftoverSweep.h"
#include "support/LogManager.h"
#include "support/OwnerOnlyFiles.h"
#include "support/SystemSignalHandler.h"
#include "touchui/KSInputContext.h"

#include <QApplication>
#include <QPixmapCache>
#include <QStringList>
#include <chrono>
#include <cstdio>
#include <string>

namespace
{

const QString RIGHT_OPTION = QStringLiteral("-right");
constexpr int RIGHT_WINDOW_LEFT = 1280;
constexpr std::chrono::seconds SYNC_DEADLINE(10);
constexpr int LOG_NUMBER = 400;
constexpr int SMALL_PICTURES = 1024; // kB; widgets keep larger pictures themselves

// Called in the GUI thread when a signal tells the process to end.
void onSystemSingleCaught()
{
    if (pMainWindow)
        pMainWindow->endProcess();
}

// Logs the files that are written but not synced, which a power failure may still destroy.
void logUnsynced()
{
    for (const std::string& path : FileSyncQueue::unsynced())
        LOG_DEBUG_OPERATE(L"Titler", LOG_NUMBER,
                          QStringLiteral("ends before this is on the disk: ").toStdWString() +
                              QString::fromStdString(path).toStdWString());
}

} // namespace

int main(int argc, char* argv[])
{
    OwnerOnlyFiles::setUmask();
    const std::string problem = DataPathCheck::problem();
    if (!problem.empty()) {
        std::fprintf(stderr, "titler: %s\n", problem.c_str());
        return DataPathCheck::EXIT_CODE;
    }
    DescriptorLimit::raise();
    HeapPolicy::keepFlat();
    QPixmapCache::setCacheLimit(SMALL_PICTURES);
    KSInputContext::install();
    QApplication application(argc, argv);
    application.setObjectName(QStringLiteral("Titler"));
    // The process must not end when its window is hidden or closed.
    QApplication::setQuitOnLastWindowClosed(false);

    APPEventFilter::instance();
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);

    const QStringList arguments = application.arguments().mid(1);
    registerSystemSignalHandler(onSystemSingleCaught, "KS2Titler");

    LeftoverSweep::sweepProgramFolders();
    pMainWindow = new TitlerWindow(true, nullptr);
    pMainWindow->move(arguments.contains(RIGHT_OPTION) ? RIGHT_WINDOW_LEFT : 0, 0);
    pMainWindow->setRealClose(false);
    pMainWindow->setVisible(false);

    const int result = QApplication::exec();

    if (!FileSyncQueue::flush(SYNC_DEADLINE))
        logUnsynced();
    delete pMainWindow;
    pMainWindow = nullptr;
    APPEventFilter::release();
    return result;
}
