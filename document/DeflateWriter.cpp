#include "document/DeflateWriter.h"

#include <algorithm>
#include <array>
#include <bit>
#include <cstddef>
#include <cstring>
#include <functional>
#include <utility>
#include <vector>

namespace
{

// The longest code of a block: four of them, or two with the bits that follow them, fit into 64 bits behind
// an unfinished byte.
constexpr unsigned MAX_CODE_BITS = 12;
constexpr unsigned MAX_HEADER_CODE_BITS = 7;
constexpr qsizetype MAX_TOKEN_SIZE = 6; // bytes
constexpr qsizetype MAX_BLOCK_OVERHEAD = 512;
constexpr std::size_t END_OF_BLOCK = 256;
constexpr std::size_t FIRST_LENGTH = 257;
constexpr std::size_t LITERALS = 286; // bytes, the end of a block, and lengths
constexpr std::size_t DISTANCES = 30;
using LiteralCounts = std::array<std::uint32_t, LITERALS>;
using DistanceCounts = std::array<std::uint32_t, DISTANCES>;

struct Code {
    std::uint32_t bits = 0; // the first is the lowest
    std::uint32_t number = 0;
};

// Lengths and distances are written as a symbol for their top bits, and the bits below.
struct Split {
    std::uint32_t symbol;
    std::uint32_t below;
    std::uint32_t number; // of bits below
};

constexpr Split split(std::uint32_t value, int topBits)
{
    const int below = std::max(0, static_cast<int>(std::bit_width(value)) - 1 - topBits);
    return {(static_cast<std::uint32_t>(below) << topBits) + (value >> below), value & ((1U << below) - 1),
            static_cast<std::uint32_t>(below)};
}

constexpr Split splitDistance(std::uint32_t distance)
{
    return split(distance - 1, 1);
}

// By the length of the match.
constexpr auto LENGTHS = [] {
    std::array<Split, DeflateWriter::MAX_MATCH + 1> lengths{};
    for (std::uint32_t length = DeflateWriter::MIN_MATCH; length < lengths.size(); ++length)
        lengths[length] = split(length - DeflateWriter::MIN_MATCH, 2);
    lengths.back() = {28, 0, 0}; // a symbol of its own
    for (Split& length : lengths)
        length.symbol += FIRST_LENGTH;
    return lengths;
}();

// Returns how many bits a Huffman code has for each of the weights, which are in rising order.
std::vector<std::uint32_t> codeLengths(std::vector<std::uint32_t> weights)
{
    const std::size_t count = weights.size();
    const std::size_t root = 2 * count - 2;
    std::vector<std::size_t> parents(root + 1);
    weights.resize(root + 1);
    std::size_t leaf = 0;
    std::size_t joined = count; // nodes that join two others are in rising order, too
    for (std::size_t next = count; next <= root; ++next) {
        for (int i = 0; i < 2; ++i) {
            const bool takeLeaf = leaf < count && (joined == next || weights[leaf] <= weights[joined]);
            const std::size_t lightest = takeLeaf ? leaf++ : joined++;
            weights[next] += weights[lightest];
            parents[lightest] = next;
        }
    }
    std::vector<std::uint32_t> lengths(root + 1);
    lengths[root] = count == 1 ? 1 : 0;
    for (std::size_t i = root; i-- > 0;)
        lengths[i] = lengths[parents[i]] + 1;
    lengths.resize(count);
    return lengths;
}

// Returns a code for each symbol that occurs.
template <std::size_t N>
std::array<Code, N> codesFor(const std::array<std::uint32_t, N>& counts, unsigned maxBits)
{
    std::vector<std::pair<std::uint32_t, std::size_t>> used; // count and symbol
    for (std::size_t symbol = 0; symbol < N; ++symbol)
        if (counts[symbol] > 0)
            used.emplace_back(counts[symbol], symbol);
    std::sort(used.begin(), used.end());
    std::vector<std::uint32_t> weights(used.size());
    std::vector<std::uint32_t> lengths;
    // The flatter the weights, the shorter is the longest code, which is that of the lightest.
    for (int flatter = 0; !used.empty() && (flatter == 0 || lengths.front() > maxBits); ++flatter) {
        std::transform(used.begin(), used.end(), weights.begin(),
                       [&](const auto& symbol) { return std::max(symbol.first >> flatter, 1U); });
        lengths = codeLengths(weights);
    }

    std::array<Code, N> codes{};
    std::array<std::uint32_t, MAX_CODE_BITS + 2> next{}; // code of each length
    for (std::size_t i = 0; i < used.size(); ++i) {
        codes[used[i].second].number = lengths[i];
        ++next[lengths[i] + 1];
    }
    for (std::size_t length = 1; length < next.size(); ++length)
        next[length] = (next[length] + next[length - 1]) << 1;
    for (Code& code : codes) {
        const std::uint32_t value = code.number > 0 ? next[code.number]++ : 0;
        for (std::uint32_t bit = 0; bit < code.number; ++bit)
            code.bits |= (value >> bit & 1) << (code.number - 1 - bit);
    }
    return codes;
}

} // namespace

struct DeflateWriter::Codes {
    std::array<Code, LITERALS> literals;
    std::array<Code, DISTANCES> distances;
};

inline void DeflateWriter::Bits::put(std::uint64_t bits, unsigned number)
{
    pending |= bits << pendingNumber;
    pendingNumber += number;
    std::memcpy(end, &pending, sizeof pending);
    end += pendingNumber / 8;
    pending >>= pendingNumber & ~7U;
    pendingNumber &= 7;
}

QByteArray DeflateWriter::finish(Ending ending)
{
    writeBlock(ending == Ending::Final);
    if (ending == Ending::Continued)
        m_bits.put(0, 3); // stored, not the last block
    m_bits.put(0, -m_bits.pendingNumber & 7);
    if (ending == Ending::Continued)
        m_bits.put(0xffff0000, 32); // the stored size and its complement
    m_out.resize(m_bits.end - m_out.constData());
    m_bits = {};
    return std::exchange(m_out, {});
}

void DeflateWriter::writeBlock(bool isLast)
{
    const qsizetype size = m_bits.end ? m_bits.end - m_out.constData() : 0;
    m_out.resize(size + static_cast<qsizetype>(m_count) * MAX_TOKEN_SIZE + MAX_BLOCK_OVERHEAD);
    m_bits.end = m_out.data() + size;

    LiteralCounts literals{};
    DistanceCounts distances{};
    for (std::size_t i = 0; i < m_count; ++i) {
        const Token token = m_tokens[i];
        if (token.number == 0) {
            ++literals[LENGTHS[token.length].symbol];
            ++distances[splitDistance(token.value).symbol];
        }
        for (unsigned byte = 0; byte < token.number; ++byte)
            ++literals[token.value >> 8 * byte & 0xff];
    }
    literals[END_OF_BLOCK] = 1;
    const Codes codes{codesFor(literals, MAX_CODE_BITS), codesFor(distances, MAX_CODE_BITS)};
    m_bits.put(isLast ? 1 : 0, 1);
    m_bits.put(2, 2); // with codes of its own
    writeCodes(codes);
    writeTokens(codes);
    m_count = 0;
}

// Writes the lengths of both codes, as symbols of a third one, in which runs of zeros have symbols of their
// own.
void DeflateWriter::writeCodes(const Codes& codes)
{
    constexpr std::array<std::size_t, 19> ORDER = {16, 17, 18, 0, 8,  7, 9,  6, 10, 5,
                                                   11, 4,  12, 3, 13, 2, 14, 1, 15};
    std::vector<std::uint32_t> lengths;
    for (const Code& code : codes.literals)
        lengths.push_back(code.number);
    for (const Code& code : codes.distances)
        lengths.push_back(code.number);

    std::vector<Split> symbols;
    std::array<std::uint32_t, ORDER.size()> counts{};
    for (auto at = lengths.begin(); at != lengths.end();) {
        const auto end = at + std::min<std::ptrdiff_t>(lengths.end() - at, 138);
        const auto zeros = static_cast<std::uint32_t>(std::find_if(at, end, std::identity()) - at);
        if (zeros >= 11)
            symbols.push_back({18, zeros - 11, 7});
        else if (zeros >= 3)
            symbols.push_back({17, zeros - 3, 3});
        else
            symbols.push_back({*at, 0, 0});
        at += zeros >= 3 ? zeros : 1;
        ++counts[symbols.back().symbol];
    }
    const auto header = codesFor(counts, MAX_HEADER_CODE_BITS);
    m_bits.put(LITERALS - FIRST_LENGTH, 5);
    m_bits.put(DISTANCES - 1, 5);
    m_bits.put(ORDER.size() - 4, 4);
    for (const std::size_t symbol : ORDER)
        m_bits.put(header[symbol].number, 3);
    for (const Split& symbol : symbols) {
        m_bits.put(header[symbol.symbol].bits, header[symbol.symbol].number);
        m_bits.put(symbol.below, symbol.number);
    }
}

void DeflateWriter::writeTokens(const Codes& codes)
{
    Bits out = m_bits; // in registers
    for (std::size_t i = 0; i < m_count; ++i) {
        const Token token = m_tokens[i];
        std::uint64_t bits = 0;
        unsigned number = 0;
        const auto append = [&](std::uint64_t more, unsigned moreNumber) {
            bits |= more << number;
            number += moreNumber;
        };
        const auto appendByte = [&](int index) {
            const Code code = codes.literals[token.value >> 8 * index & 0xff];
            append(code.bits, code.number);
        };
        if (token.number == 0) {
            const Split length = LENGTHS[token.length];
            const Split distance = splitDistance(token.value);
            append(codes.literals[length.symbol].bits, codes.literals[length.symbol].number);
            append(length.below, length.number);
            append(codes.distances[distance.symbol].bits, codes.distances[distance.symbol].number);
            append(distance.below, distance.number);
        } else {
            appendByte(0);
            if (token.number > 1) {
                appendByte(1);
                appendByte(2);
            }
            if (token.number > 3)
                appendByte(3);
        }
        out.put(bits, number);
    }
    out.put(codes.literals[END_OF_BLOCK].bits, codes.literals[END_OF_BLOCK].number);
    m_bits = out;
}
