// Memory blocks of one small size, which threads keep for the next use instead of giving them back at once.
#pragma once

#include <cstddef>
#include <utility>

namespace HostKit {

class SmallBlocks {
public:
    static constexpr std::size_t size = 48;

    /// A block for the calling thread; throws std::bad_alloc when there is none.
    static void* take() {
        void* const block = takeSpare();
        return block != nullptr ? block : takeFromList();
    }

    /// The block that this thread gave last, or null when it has been taken since.
    static void* takeSpare() noexcept { return std::exchange(s_store.spare, nullptr); }

    /// Takes back a block, of this thread or another one.
    static void give(void* memory) noexcept {
        FreeBlock* const block = static_cast<FreeBlock*>(memory);
        if (s_store.spare == nullptr && s_store.limit != 0) {
            s_store.spare = block;
        } else {
            giveToList(block);
        }
    }

private:
    struct FreeBlock {
        FreeBlock* next;
    };

    /// The free blocks of one thread. It has neither constructor nor destructor to run, so it is good from the thread's
    /// first moment to its last; what must be done at the thread's end is Closing's.
    struct Store {
        FreeBlock* spare;  ///< the block given last, so that taking and giving in turn touch nothing else
        FreeBlock* list;
        unsigned count;  ///< blocks in the list
        unsigned limit;  ///< how many to keep there: 0 before the first block is given and when the thread ends
        bool isClosed;
    };
    struct Closing;

    static void* takeFromList();
    static void giveToList(FreeBlock* block) noexcept;

    /// A shared library calls a function to find an object of the thread, which takes longer than all that is done
    /// here. With a fixed place among the thread's objects it need not; so small a library may be loaded late even so.
    [[gnu::tls_model("initial-exec")]] static inline thread_local Store s_store{};
};

}  // namespace HostKit
