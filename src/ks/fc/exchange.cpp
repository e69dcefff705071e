#include "ks/fc/exchange.h"

#include <algorithm>
#include <cstddef>
#include <new>

namespace {

/// Pieces of memory of one size, cut from large blocks. When the last piece has come back the blocks are given up.
template <std::size_t Size>
class PieceStore
{
public:
    void* Take()
    {
        ++m_taken;
        if (m_returned) {
            void* piece = m_returned;
            m_returned = m_returned->next;
            return piece;
        }
        if (m_next == m_end) {
            // As large as all blocks before: a few large ones cost the operating system less than many small ones.
            m_end = std::clamp(m_end * 2, SmallestBlock, LargestBlock);
            m_blocks.push_back(std::make_unique_for_overwrite<Piece[]>(m_end));
            m_next = 0;
        }
        return &m_blocks.back()[m_next++];
    }
    void Return(void* memory)
    {
        auto* piece = static_cast<Piece*>(memory);
        piece->next = m_returned;
        m_returned = piece;
        if (--m_taken > 0)
            return;
        m_returned = nullptr;
        m_blocks.clear();
        m_next = m_end = 0;
    }

private:
    union Piece {
        Piece* next;
        std::byte memory[Size];
    };
    static constexpr std::size_t SmallestBlock = 256, LargestBlock = 1 << 18; // pieces

    std::vector<std::unique_ptr<Piece[]>> m_blocks;
    Piece* m_returned = nullptr;       // those that can be taken again
    std::size_t m_next = 0, m_end = 0; // of the last block: the first that was never taken, and its size
    std::size_t m_taken = 0;
};

static_assert(alignof(CKvr_CBE_ModelDataItem) <= alignof(void*));

auto& DataItems()
{
    // Never destroyed: an item may outlive everything that has a destructor.
    static auto* store = new PieceStore<sizeof(CKvr_CBE_ModelDataItem)>;
    return *store;
}

} // namespace

void* CKvr_CBE_ModelDataItem::operator new(std::size_t size)
{
    return size == sizeof(CKvr_CBE_ModelDataItem) ? DataItems().Take() : ::operator new(size);
}

void CKvr_CBE_ModelDataItem::operator delete(void* item, std::size_t size)
{
    if (size == sizeof(CKvr_CBE_ModelDataItem))
        DataItems().Return(item);
    else
        ::operator delete(item);
}
