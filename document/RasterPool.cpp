#include "document/RasterPool.h"

#include <algorithm>
#include <cstddef>
#include <memory>
#include <mutex>
#include <new>
#include <utility>
#include <vector>

namespace
{

struct Block {
    std::unique_ptr<uchar[]> bytes;
    qsizetype size = 0;
};

class Blocks
{
public:
    // Never destroyed, because a picture may be destroyed later than the static objects.
    static Blocks& instance()
    {
        static auto* const blocks = new Blocks;
        return *blocks;
    }

    // Returns the smallest block that is large enough, or a new one, without memory if that is lacking.
    std::unique_ptr<Block> take(qsizetype size)
    {
        const std::lock_guard lock(m_mutex);
        const auto found =
            std::min_element(m_kept.begin(), m_kept.end(), [size](const auto& a, const auto& b) {
                return std::pair(a->size < size, a->size) < std::pair(b->size < size, b->size);
            });
        if (found == m_kept.end() || (*found)->size < size)
            return std::make_unique<Block>(Block{
                std::unique_ptr<uchar[]>(new (std::nothrow) uchar[static_cast<std::size_t>(size)]), size});
        std::unique_ptr<Block> block = std::move(*found);
        m_kept.erase(found);
        m_bytes -= block->size;
        return block;
    }

    void giveBack(std::unique_ptr<Block> block)
    {
        const std::lock_guard lock(m_mutex);
        if (m_bytes + block->size > RasterPool::LIMIT)
            return;
        m_bytes += block->size;
        m_kept.push_back(std::move(block));
    }

    void clear()
    {
        const std::lock_guard lock(m_mutex);
        m_kept.clear();
        m_bytes = 0;
    }

    qsizetype bytes()
    {
        const std::lock_guard lock(m_mutex);
        return m_bytes;
    }

private:
    std::mutex m_mutex;
    std::vector<std::unique_ptr<Block>> m_kept;
    qsizetype m_bytes = 0;
};

} // namespace

QImage RasterPool::take(QSize size)
{
    const qsizetype lineSize = qsizetype(size.width()) * qsizetype(sizeof(QRgb));
    std::unique_ptr<Block> block = Blocks::instance().take(lineSize * size.height());
    if (!block->bytes)
        return {};
    uchar* const bytes = block->bytes.get();
    const auto giveBack = [](void* taken) {
        Blocks::instance().giveBack(std::unique_ptr<Block>(static_cast<Block*>(taken)));
    };
    QImage image(bytes, size.width(), size.height(), lineSize, QImage::Format_ARGB32_Premultiplied, giveBack,
                 block.get());
    if (!image.isNull())
        (void)block.release(); // the image owns it
    return image;
}

void RasterPool::clear()
{
    Blocks::instance().clear();
}

qsizetype RasterPool::keptBytes()
{
    return Blocks::instance().bytes();
}
