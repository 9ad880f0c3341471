#include "app/APPEventFilter.h"
#include "app/TitlerWindow.h"
#include "support/SystemSignalHandler.h"
#include "touchui/KSInputContext.h"

#include <QApplication>
#include <QStringList>

namespace
{

const QString RIGHT_OPTION = QStringLiteral("-right");
constexpr int RIGHT_WINDOW_LEFT = 1280;

// Called in the GUI thread when the process is told to stop.
void onSystemSingleCaught()
{
    if (pMainWindow)
        pMainWindow->endProcess();
}

} // namespace

int main(int argc, char* argv[])
{
    KSInputContext::install();
    QApplication application(argc, argv);
    application.setObjectName(QStringLiteral("Titler"));
    // The process outlives its window: hiding or closing a window must not end it by itself.
    QApplication::setQuitOnLastWindowClosed(false);

    APPEventFilter::instance();
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);

    const QStringList arguments = application.arguments().mid(1);
    registerSystemSignalHandler(onSystemSingleCaught, "KS2Titler");

    pMainWindow = new TitlerWindow(true, nullptr);
    pMainWindow->move(arguments.contains(RIGHT_OPTION) ? RIGHT_WINDOW_LEFT : 0, 0);
    pMainWindow->setRealClose(false);
    pMainWindow->setVisible(false);

    const int result = QApplication::exec();

    delete pMainWindow;
    pMainWindow = nullptr;
    APPEventFilter::release();
    return result;
}
