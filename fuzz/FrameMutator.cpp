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
    Mutation(std::vector<FrameCall>& calls, unsigned seed) : m_calls(calls), m_random(seed) {}

    void run()
    {
        if (m_calls.empty())
            m_calls.emplace_back();
        const std::size_t at = below(m_calls.size());
        switch (below(8)) {
        case 0: {
            const FrameCall copy = m_calls[at];
            m_calls.insert(m_calls.begin() + std::ptrdiff_t(below(m_calls.size() + 1)), copy);
            return;
        }
        case 1:
            m_calls.erase(m_calls.begin() + std::ptrdiff_t(at));
            return;
        case 2:
            std::swap(m_calls[at], m_calls[below(m_calls.size())]);
            return;
        case 3:
            m_calls[at].object = std::uint8_t(below(16));
            return;
        case 4:
            m_calls[at].method = std::uint8_t(below(10));
            return;
        case 5:
            m_calls[at].flags ^= std::uint8_t(1U << below(5));
            return;
        default:
            changePayload(m_calls[at].payload);
        }
    }

private:
    std::size_t below(std::size_t bound) { return bound == 0 ? 0 : m_random() % bound; }

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

    std::vector<FrameCall>& m_calls;
    std::mt19937 m_random;
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
