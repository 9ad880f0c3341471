#pragma once

class QString;

// The entries of the operation log about what the operator has typed.
namespace TypedTextLog
{

// Writes nothing for an empty text and one of control characters only, as Enter and Backspace bring them.
void write(QString text);

} // namespace TypedTextLog
