#include "support/guarded.hpp"

#include <sys/mman.h>
#include <unistd.h>

#include <algorithm>
#include <cstdlib>
#include <stdexcept>

namespace zt {

namespace {
std::size_t pageSize()
{
    static const std::size_t p = static_cast<std::size_t>(sysconf(_SC_PAGESIZE));
    return p;
}
} // namespace

PageBlock::PageBlock(std::size_t bytes) : size_(bytes)
{
    const std::size_t page = pageSize();
    const std::size_t dataPages = (bytes + page - 1) / page;
    mapBytes_ = (dataPages + 2) * page;
    void* m = mmap(nullptr, mapBytes_, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
    if (m == MAP_FAILED)
        std::abort();
    map_ = static_cast<uint8_t*>(m);
    mprotect(map_, page, PROT_NONE);
    mprotect(map_ + (dataPages + 1) * page, page, PROT_NONE);
    begin_ = map_ + (dataPages + 1) * page - bytes; // the block ends at the upper guard page
}

PageBlock::~PageBlock()
{
    munmap(map_, mapBytes_);
}

namespace {
// Extent of the region relative to row 0: [lo, hi).
void extent(const PlaneShape& s, std::ptrdiff_t& lo, std::ptrdiff_t& hi)
{
    const std::ptrdiff_t last = static_cast<std::ptrdiff_t>(s.rows - 1) * s.step;
    lo = std::min<std::ptrdiff_t>(0, last);
    hi = std::max<std::ptrdiff_t>(0, last) + s.rowBytes;
}

std::size_t blockBytes(const PlaneShape& s, std::size_t& originOffset)
{
    std::ptrdiff_t lo, hi;
    extent(s, lo, hi);
    const std::size_t lead = 16; // guard bytes before the lowest row
    std::size_t tail = 0;
    if (s.misalign >= 0) {
        // Row 0 sits at (block end - tail - hi); the block end is page aligned.
        tail = static_cast<std::size_t>(((-(s.misalign) - hi) % 16 + 32) % 16) + 16;
    }
    originOffset = lead - static_cast<std::size_t>(lo);
    return originOffset + static_cast<std::size_t>(hi) + tail;
}
} // namespace

Plane::Plane(const PlaneShape& shape, Rng& rng)
    : shape_(shape), block_([&] {
          std::size_t o;
          return blockBytes(shape, o);
      }())
{
    std::size_t o;
    blockBytes(shape, o);
    origin_ = block_.begin() + o;
    std::uniform_int_distribution<int> byte(0, 255);
    for (uint8_t* p = block_.begin(); p != block_.end(); ++p)
        *p = static_cast<uint8_t>(byte(rng));
}

bool Plane::inRegion(std::size_t offset) const
{
    const std::ptrdiff_t rel = static_cast<std::ptrdiff_t>(offset) - (origin_ - block_.begin());
    for (int r = 0; r < shape_.rows; ++r) {
        const std::ptrdiff_t start = static_cast<std::ptrdiff_t>(r) * shape_.step;
        if (rel >= start && rel < start + shape_.rowBytes)
            return true;
    }
    return false;
}

void Plane::restore(const std::vector<uint8_t>& b) const
{
    std::copy(b.begin(), b.end(), block_.begin());
}

long Plane::firstGuardChange(const std::vector<uint8_t>& before) const
{
    for (std::size_t i = 0; i < block_.size(); ++i)
        if (block_.begin()[i] != before[i] && !inRegion(i))
            return static_cast<long>(i);
    return -1;
}

int pickStep(int kind, int rows, int rowBytes, Rng& rng)
{
    std::uniform_int_distribution<int> pad(0, 17);
    switch (kind) {
    case 1:
        return 0;
    case 2:
        return -(rowBytes + pad(rng));
    default:
        return rowBytes + pad(rng);
    }
    (void)rows;
}

} // namespace zt
