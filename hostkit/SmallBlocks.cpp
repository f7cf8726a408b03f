#include "SmallBlocks.h"

#include <new>

namespace HostKit {

/// Gives the blocks back when the thread ends. Objects that live longer, such as statics, use the heap directly then.
struct SmallBlocks::Closing {
    ~Closing() {
        FreeBlock* block = s_store.list;
        ::operator delete(s_store.spare);
        s_store = Store{nullptr, nullptr, 0, 0, true};
        while (block != nullptr) {
            FreeBlock* const next = block->next;
            ::operator delete(block);
            block = next;
        }
    }

    void openStore() const noexcept { s_store.limit = 256; }
};

void* SmallBlocks::takeFromList() {
    FreeBlock* const block = s_store.list;
    if (block == nullptr) {
        return ::operator new(size);
    }
    s_store.list = block->next;
    --s_store.count;
    return block;
}

void SmallBlocks::giveToList(FreeBlock* block) noexcept {
    static thread_local const Closing closing;
    if (s_store.limit == 0 && !s_store.isClosed) {
        closing.openStore();
    }
    if (s_store.count < s_store.limit) {
        block->next = s_store.list;
        s_store.list = block;
        ++s_store.count;
    } else {
        ::operator delete(block);
    }
}

}  // namespace HostKit
