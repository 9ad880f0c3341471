// titlectl: makes, renders, checks, shows and changes titles without a window and without a display.

#include "support/FileSyncQueue.h"
#include "support/HeapPolicy.h"
#include "support/OwnerOnlyFiles.h"
#include "titlectl/CommandTable.h"
#include "titlectl/ProgramTexts.h"
#include "titlectl/RenderWorker.h"

#include <QApplication>
#include <QFile>
#include <QFont>
#include <QString>
#include <QStringList>
#include <QtGlobal>
#include <chrono>
#include <cstdio>
#include <iostream>
#include <optional>
#include <unistd.h>

namespace
{

constexpr std::chrono::seconds SYNC_DEADLINE(60);

// Drops Qt's remarks about its surroundings, which would stand between the messages of the command.
void showErrorsOnly(QtMsgType type, const QMessageLogContext& /*context*/, const QString& text)
{
    if (type == QtCriticalMsg || type == QtFatalMsg)
        std::fprintf(stderr, "titlectl: %s\n", qUtf8Printable(text));
}

QStringList wordsOf(int argc, char* argv[])
{
    QStringList words;
    for (int i = 1; i < argc; ++i)
        words.append(QString::fromLocal8Bit(argv[i]));
    return words;
}

int run(const CommandTable& table, const QStringList& words)
{
    if (words == QStringList{RenderWorker::COMMAND}) {
        RenderWorker::serve(std::cin, std::cout);
        return 0;
    }
    QFile result;
    QFile messages;
    result.open(STDOUT_FILENO, QIODevice::WriteOnly | QIODevice::Unbuffered);
    messages.open(STDERR_FILENO, QIODevice::WriteOnly | QIODevice::Unbuffered);
    return table.run(words, result, messages, ::isatty(STDERR_FILENO) == 1);
}

} // namespace

int main(int argc, char* argv[])
{
    OwnerOnlyFiles::setUmask();
    HeapPolicy::keepFlat();
    qputenv("QT_QPA_PLATFORM", "offscreen");
    qInstallMessageHandler(showErrorsOnly);
    const QStringList words = wordsOf(argc, argv); // Qt removes those that it understands
    const CommandTable table;
    // Texts about the program need neither fonts nor titles.
    if (const std::optional<QString> text = ProgramTexts(table).textFor(words.value(0))) {
        std::cout << text->toStdString() << std::flush;
        return 0;
    }
    const QApplication application(argc, argv);
    // The font that the titler's window starts from, so that empty lines come out equally high.
    QApplication::setFont(QFont(QStringLiteral("KST-Medium"), 12));
    const int code = run(table, words);
    if (!FileSyncQueue::flush(SYNC_DEADLINE))
        std::fprintf(stderr, "titlectl: the disk has not taken all files yet\n");
    return code;
}
