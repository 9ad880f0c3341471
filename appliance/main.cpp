// Runs the appliance around a titler as one program without a window: both sibling processes are controlled
// by lines on standard input and write one line of JSON to standard output for every event.
#include "appliance/Appliance.h"
#include "appliance/CommandInterpreter.h"
#include "appliance/LineReader.h"
#include "support/OwnerOnlyFiles.h"
#include "support/SystemSignalHandler.h"

#include <QCommandLineParser>
#include <QCoreApplication>
#include <QJsonDocument>

#include <unistd.h>

#include <cstdio>

namespace
{

void writeEvent(const QJsonObject& event)
{
    const QByteArray line = QJsonDocument(event).toJson(QJsonDocument::Compact) + '\n';
    std::fwrite(line.constData(), 1, static_cast<std::size_t>(line.size()), stdout);
    std::fflush(stdout);
}

} // namespace

int main(int argc, char** argv)
{
    OwnerOnlyFiles::setUmask();
    QCoreApplication application(argc, argv);
    QCommandLineParser options;
    options.setApplicationDescription("The appliance around a titler, driven by lines on standard input.");
    options.addHelpOption();
    const QCommandLineOption stay("stay",
                                  "Go on after the end of the input, until a signal ends the program.");
    options.addOption(stay);
    options.process(application);
    registerSystemSignalHandler([] { QCoreApplication::quit(); }, "appliance");

    Appliance appliance(writeEvent);
    if (!appliance.start()) {
        writeEvent({{"event", "error"}, {"message", "a port cannot be bound"}});
        return 1;
    }
    CommandInterpreter interpreter(appliance, writeEvent);
    QObject::connect(&interpreter, &CommandInterpreter::quitRequested, &application, &QCoreApplication::quit,
                     Qt::QueuedConnection);
    LineReader reader(STDIN_FILENO);
    QObject::connect(&reader, &LineReader::lineRead, &interpreter, &CommandInterpreter::addLine);
    if (!options.isSet(stay))
        QObject::connect(&reader, &LineReader::ended, &interpreter, &CommandInterpreter::endOfInput);
    writeEvent({{"event", "ready"}});
    return QCoreApplication::exec();
}
