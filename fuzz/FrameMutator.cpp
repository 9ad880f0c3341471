// Mutates sequences of calls: calls are duplicated, removed, moved and sent to other objects and methods, and
// get payloads that are packed as the program packs them, or nearly.
#include "FrameScript.h"

#include <random>

extern "C" std::size_t LLVMFuzzerMutate(std::uint8_t* data, std::size_t size, std::size_t maximum);

namespace
{

class Mutation
{
public:
    Mutation(std::vector<FrameCall>& calls, unsigned seed) : mCalls(calls), mRandom(seed) {}

    void run()
    {
        if (mCalls.empty())
            mCalls.emplace_back();
        const std::size_t at = below(mCalls.size());
        switch (below(8)) {
        case 0: {
            const FrameCall copy = mCalls[at];
            mCalls.insert(mCalls.begin() + std::ptrdiff_t(below(mCalls.size() + 1)), copy);
            return;
        }
        case 1:
            mCalls.erase(mCalls.begin() + std::ptrdiff_t(at));
            return;
        case 2:
            std::swap(mCalls[at], mCalls[below(mCalls.size())]);
            return;
        case 3:
            mCalls[at].object = std::uint8_t(below(16));
            return;
        case 4:
            mCalls[at].method = std::uint8_t(below(10));
            return;
        case 5:
            mCalls[at].flags ^= std::uint8_t(1U << below(5));
            return;
        default:
            changePayload(mCalls[at].payload);
        }
    }

private:
    std::size_t below(std::size_t bound) { return bound == 0 ? 0 : mRandom() % bound; }

    // Writes one packed value at a random place, mostly at the end: a small number, a number of a certain
    // width, or a string.
    void changePayload(std::vector<std::uint8_t>& payload)
    {
        std::vector<std::uint8_t> value;
        switch (below(4)) {
        case 0:
            value = {std::uint8_t(below(256))};
            break;
        case 1:
            for (const unsigned char tag = static_cast<unsigned char>(0xc0 + below(0x20)); value.empty();)
                value.push_back(tag);
            for (std::size_t i = 0, width = std::size_t(1) << below(4); i < width; ++i)
                value.push_back(below(3) == 0 ? 0xff : std::uint8_t(below(256)));
            break;
        case 2:
            value.assign(below(300), std::uint8_t('a' + below(26)));
            value.insert(value.begin(), {0xda, std::uint8_t(value.size() >> 8), std::uint8_t(value.size())});
            break;
        default:
            if (!payload.empty())
                payload.resize(below(payload.size()));
            return;
        }
        const std::size_t at = below(3) == 0 ? below(payload.size() + 1) : payload.size();
        payload.insert(payload.begin() + std::ptrdiff_t(at), value.begin(), value.end());
    }

    std::vector<FrameCall>& mCalls;
    std::mt19937 mRandom;
};

} // namespace

extern "C" std::size_t LLVMFuzzerCustomMutator(std::uint8_t* data, std::size_t size, std::size_t maximum,
                                               unsigned seed)
{
    if (seed % 3 == 0)
        return LLVMFuzzerMutate(data, size, maximum);
    std::vector<FrameCall> calls = FrameCall::read(data, size);
    for (unsigned i = 0; i <= seed % 4; ++i)
        Mutation(calls, seed + i).run();
    const std::vector<std::uint8_t> bytes = FrameCall::write(calls);
    if (bytes.size() > maximum)
        return LLVMFuzzerMutate(data, size, maximum);
    std::copy(bytes.begin(), bytes.end(), data);
    return bytes.size();
}
