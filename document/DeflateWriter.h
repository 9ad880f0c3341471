#pragma once

#include <QByteArray>
#include <cstddef>
#include <cstdint>
#include <memory>

// Writes a part of a deflate stream (RFC 1951) from bytes and matches that the caller has found. Each block
// has Huffman codes made for what it contains. Parts written for consecutive data, by any writers, form one
// stream when put one after the other. A writer keeps its buffer, 256 kB, for the next part. One thread at a
// time.
class DeflateWriter
{
public:
    static constexpr int MIN_MATCH = 3;        // bytes
    static constexpr int MAX_MATCH = 258;      // bytes
    static constexpr int MAX_DISTANCE = 32768; // bytes

    enum class Ending {
        Continued, // an empty stored block follows, so that the next part begins with a byte of its own
        Final,     // the stream ends
    };

    // Adds the lowest bytes of the value, 1, 3 or 4, the lowest first.
    void addBytes(std::uint32_t value, int number) { add({value, static_cast<std::uint16_t>(number), 0}); }
    // Adds as many bytes as length says, equal to those that begin distance bytes earlier in this part.
    void addMatch(int length, int distance)
    {
        add({static_cast<std::uint32_t>(distance), 0, static_cast<std::uint16_t>(length)});
    }

    // Ends the part, to which something was added, and returns it.
    QByteArray finish(Ending ending);

private:
    struct Codes;
    struct Token {
        std::uint32_t value;  // bytes, or the distance of a match
        std::uint16_t number; // of bytes; 0 for a match
        std::uint16_t length; // of the match
    };
    // The end of what is written.
    struct Bits {
        void put(std::uint64_t bits, unsigned number);

        char* end = nullptr;       // of the whole bytes
        std::uint64_t pending = 0; // bits that do not fill a byte, the first is the lowest
        unsigned pendingNumber = 0;
    };
    static constexpr std::size_t BLOCK_TOKENS = 32768;

    void add(Token token)
    {
        if (m_count == BLOCK_TOKENS)
            writeBlock(false);
        m_tokens[m_count++] = token;
    }
    void writeBlock(bool isLast);
    void writeCodes(const Codes& codes);
    void writeTokens(const Codes& codes);

    std::unique_ptr<Token[]> m_tokens = std::make_unique_for_overwrite<Token[]>(BLOCK_TOKENS);
    std::size_t m_count = 0;
    QByteArray m_out; // with room for the block that is being written
    Bits m_bits;
};
