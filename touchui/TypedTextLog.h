#pragma once

class QString;

// Writes the operator's typed text to the operation log.
namespace TypedTextLog
{

// Ignores an empty text and one of control characters only, as Enter and Backspace produce.
void write(QString text);

} // namespace TypedTextLog
