// A block with a forbidden page on either side, for the bytes of a message. They can be read only
// while they are lent.
#ifndef MODEL_FENCE_H
#define MODEL_FENCE_H

#include "support/fakevm.h"

#include <sys/mman.h>
#include <unistd.h>

#include <algorithm>

class Fence : public fakevm::Lender {
public:
    bool front = false; // the bytes begin behind a forbidden page instead of ending before one

    // Puts a message there; false when there is no memory.
    bool place(const fakevm::Bytes &message)
    {
        const auto page = static_cast<size_t>(sysconf(_SC_PAGESIZE));
        if (!pages_ || message.size() > room_) {
            if (pages_) {
                munmap(pages_ - page, room_ + 2 * page);
            }
            room_ = (message.size() / page + 1) * page;
            void *block =
                mmap(nullptr, room_ + 2 * page, PROT_NONE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
            if (block == MAP_FAILED) {
                return false;
            }
            pages_ = static_cast<uint8_t *>(block) + page;
        }
        mprotect(pages_, room_, PROT_READ | PROT_WRITE);
        size_ = message.size();
        bytes_ = front ? pages_ : pages_ + room_ - size_;
        std::copy(message.begin(), message.end(), bytes_);
        takeBack();
        return true;
    }

    size_t size() const { return size_; }

    const uint8_t *lend() override
    {
        mprotect(pages_, room_, PROT_READ);
        return bytes_;
    }

    void takeBack() override { mprotect(pages_, room_, PROT_NONE); }

private:
    uint8_t *bytes_ = nullptr;
    size_t size_ = 0;
    uint8_t *pages_ = nullptr;
    size_t room_ = 0; // between the forbidden pages
};

#endif
