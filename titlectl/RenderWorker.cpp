#include "titlectl/RenderWorker.h"

#include "titlectl/TitleRenderer.h"

#include <QByteArray>
#include <istream>
#include <ostream>
#include <string>

const QString RenderWorker::COMMAND = QStringLiteral("--render-worker");

void RenderWorker::serve(std::istream& input, std::ostream& output)
{
    TitleRenderer renderer;
    for (std::string line; std::getline(input, line);) {
        const std::optional<RenderJob> job = RenderJob::fromLine(QByteArray::fromStdString(line));
        QString error = job ? renderer.render(*job) : QStringLiteral("not a job");
        // A line feed would end the answer.
        output << error.replace(QLatin1Char('\n'), QLatin1Char(' ')).toStdString() << std::endl;
    }
}
