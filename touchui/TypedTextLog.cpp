#include "touchui/TypedTextLog.h"

#include "support/LogManager.h"

#include <QChar>
#include <QString>

#include <algorithm>

// Writes the text as a single entry of one line.
void TypedTextLog::write(QString text)
{
    const auto isControl = [](QChar sign) { return sign.category() == QChar::Other_Control; };
    if (!std::all_of(text.cbegin(), text.cend(), isControl)) {
        std::replace_if(text.begin(), text.end(), isControl, QLatin1Char(' '));
        LOG_USER_OPERATE(L"Text Input", 200, text.toStdWString());
    }
}
