// Guarded test images: every plane lives in a block whose highest region byte can sit right before a
// PROT_NONE page (so that a read past the region faults), with random guard bytes around and between
// rows that must come back unchanged.
#pragma once

#include <cstddef>
#include <cstdint>
#include <random>
#include <vector>

namespace zt {

using Rng = std::mt19937;

// Readable and writable bytes with an inaccessible page on each side.
class PageBlock {
public:
    explicit PageBlock(std::size_t bytes);
    ~PageBlock();
    PageBlock(const PageBlock&) = delete;
    PageBlock& operator=(const PageBlock&) = delete;
    uint8_t* begin() const { return begin_; }
    uint8_t* end() const { return begin_ + size_; }
    std::size_t size() const { return size_; }

private:
    uint8_t* map_ = nullptr;
    std::size_t mapBytes_ = 0;
    uint8_t* begin_ = nullptr;
    std::size_t size_ = 0;
};

struct PlaneShape {
    int rows = 1;
    int rowBytes = 1; // region bytes of one row
    int step = 1;     // any sign; |step| >= rowBytes unless 0
    int misalign = -1; // offset of row 0 modulo 16, or -1: the highest region byte ends the mapping
};

// One plane of a test image.
class Plane {
public:
    Plane(const PlaneShape& shape, Rng& rng);
    uint8_t* row(int r) const { return origin_ + static_cast<std::ptrdiff_t>(r) * shape_.step; }
    uint8_t* data() const { return origin_; }
    const PlaneShape& shape() const { return shape_; }
    bool inRegion(std::size_t offset) const; // offset into the block
    std::vector<uint8_t> bytes() const { return {block_.begin(), block_.end()}; }
    void restore(const std::vector<uint8_t>& b) const;
    uint8_t* blockBegin() const { return block_.begin(); }
    // First byte outside the region that differs from `before`, or -1.
    long firstGuardChange(const std::vector<uint8_t>& before) const;

private:
    PlaneShape shape_;
    PageBlock block_;
    uint8_t* origin_;
};

// A step for a plane of `rows` rows of `rowBytes` bytes: kind 0 padded positive, 1 zero, 2 negative.
int pickStep(int kind, int rows, int rowBytes, Rng& rng);

} // namespace zt
