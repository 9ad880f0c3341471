#include "document/ITitleChangeReporter.h"

#include <atomic>

namespace
{

std::atomic<ITitleChangeReporter*> gReporter{nullptr};

}

ITitleChangeReporter* ITitleChangeReporter::instance()
{
    return gReporter.load(std::memory_order_acquire);
}

void ITitleChangeReporter::setInstance(ITitleChangeReporter* reporter)
{
    gReporter.store(reporter, std::memory_order_release);
}
