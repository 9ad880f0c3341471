#pragma once

// The whole window in a process of its own, which closes a changed title of four texts each time its standard
// input brings a line, and prints the nanoseconds from Close to the answer. Its siblings take every call and
// answer none.
class ClosingWindow
{
public:
    // Makes the application; prints a line when the window is built. Ends with the standard input. Returns
    // the exit code.
    static int run(int argc, char* argv[]);
};
