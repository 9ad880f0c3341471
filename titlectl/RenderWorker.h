#pragma once

#include <QString>
#include <iosfwd>

// The other end of RenderWorkers: renders the jobs of one line each, and answers each with one line.
class RenderWorker
{
public:
    static const QString COMMAND; // the word that makes titlectl a worker

    RenderWorker() = delete;

    // Reads jobs from input until its end. Blocks; GUI thread only.
    static void serve(std::istream& input, std::ostream& output);
};
