// Repacking: every member against a model of its rule, sample by sample (D(j, i) from S by the rule's
// formula), over widths 1..70 and heights 1..8 with guarded planes, zero and negative steps and every
// misalignment; the validation rows; the round trips the rules promise.
#include "frame/exports.hpp"
#include "support/conv_sweep.hpp"

#include <string>

namespace {

using namespace zox;
using zt::Plane;
using zt::PlaneShape;
using zt::Rng;

// A side's planes in the call's order, with the region's sizes of its format.
template <class F>
struct Side : zt::PlaneSet {
    uint8_t* ptr[3] = {};
    int step[3] = {};
    Side(int w, int h, int kind, int misalign, Rng& rng)
    {
        const int ch = std::max(1, F::sampling == Sampling::S420 ? h / 2 : h);
        const int cw = std::max(1, F::sampling == Sampling::S411 ? w / 4 : w / 2);
        std::vector<std::pair<int, int>> shapes;
        if constexpr (F::planes == 3)
            shapes = {{h, w}, {ch, cw}, {ch, cw}};
        else if constexpr (F::planes == 2)
            shapes = {{h, w}, {ch, 2 * cw}};
        else
            shapes = {{h, 2 * w}};
        for (std::size_t p = 0; p < shapes.size(); ++p) {
            const int s = zt::pickStep(kind, shapes[p].first, shapes[p].second, rng);
            planes.push_back(std::make_unique<Plane>(PlaneShape{shapes[p].first, shapes[p].second, s, misalign < 0 ? -1 : (misalign + 5 * int(p)) % 16}, rng));
            ptr[p] = planes.back()->data();
            step[p] = s;
        }
    }
    // The side in Y, Cb, Cr order.
    RepackSide<uint8_t> ordered()
    {
        if constexpr (F::planes == 3)
            return sideOfPlanes<F>(ptr, step);
        else
            return sideOf(ptr[0], step[0], ptr[1], step[1]);
    }
};

template <class F>
uint8_t& lumaAt(const RepackSide<uint8_t>& s, int r, int x)
{
    return lumaRow<F>(s, r)[static_cast<std::ptrdiff_t>(F::lumaStride) * x];
}
template <class F>
uint8_t& chromaAt(const RepackSide<uint8_t>& s, int c, int j, int i)
{
    return chromaRow<F>(s, c, j)[static_cast<std::ptrdiff_t>(F::chromaStride) * i];
}

// The model: the region in use, luma copied, and each destination chroma sample by its rule's formula.
template <class C>
void model(const RepackSide<uint8_t>& s, const RepackSide<uint8_t>& d, ImageSize roi)
{
    using S = typename C::Src;
    using D = typename C::Dst;
    const int w = roi.width & (C::has411 ? ~3 : ~1), h = C::has420 ? roi.height & ~1 : roi.height;
    for (int r = 0; r < h; ++r)
        for (int x = 0; x < w; ++x)
            lumaAt<D>(d, r, x) = lumaAt<S>(s, r, x);
    const int rows = D::sampling == Sampling::S420 ? h / 2 : h, n = D::sampling == Sampling::S411 ? w / 4 : w / 2;
    for (int c = 0; c < 2; ++c)
        for (int j = 0; j < rows; ++j)
            for (int i = 0; i < n; ++i) {
                int sj = j, si = i;
                switch (C::rule) {
                case ChromaRule::Copy: break;
                case ChromaRule::RowDrop: sj = 2 * j; break;
                case ChromaRule::RowRepeat: sj = j >> 1; break;
                case ChromaRule::SampleRepeat: si = i >> 1; break;
                case ChromaRule::SampleDrop: si = 2 * i; break;
                case ChromaRule::RowFold: sj = 2 * j + (i & 1), si = i >> 1; break;
                case ChromaRule::RowUnfold: sj = j >> 1, si = 2 * i + (j & 1); break;
                }
                chromaAt<D>(d, c, j, i) = chromaAt<S>(s, c, sj, si);
            }
}

// One call with the layouts' arguments; null marks: -1 none, 0..2 a plane, 9 the pointer or array.
template <class C, class Fn>
zoxStatus call(Fn f, Side<typename C::Src>& s, Side<typename C::Dst>& d, ImageSize roi, int srcNull = -1, int dstNull = -1)
{
    const uint8_t* sp[3] = {s.ptr[0], s.ptr[1], s.ptr[2]};
    uint8_t* dp[3] = {d.ptr[0], d.ptr[1], d.ptr[2]};
    if (srcNull >= 0 && srcNull < 3)
        sp[srcNull] = nullptr;
    if (dstNull >= 0 && dstNull < 3)
        dp[dstNull] = nullptr;
    auto withDst = [&](auto... a) {
        if constexpr (C::Dst::planes == 3)
            return f(a..., dstNull == 9 ? nullptr : dp, d.step, roi);
        else if constexpr (C::Dst::planes == 2)
            return f(a..., dp[0], d.step[0], dp[1], d.step[1], roi);
        else
            return f(a..., dstNull == 9 ? nullptr : dp[0], d.step[0], roi);
    };
    if constexpr (C::Src::planes == 3)
        return withDst(srcNull == 9 ? nullptr : sp, s.step);
    else if constexpr (C::Src::planes == 2)
        return withDst(sp[0], s.step[0], sp[1], s.step[1]);
    else
        return withDst(srcNull == 9 ? nullptr : sp[0], s.step[0]);
}

// One call against the model on a copy of the same destination: status, source unchanged, nothing
// outside the region written.
template <class C, class Fn>
void checkCase(const char* name, Fn f, int w, int h, int kind, int mis, Rng& rng)
{
    const ImageSize roi{w, h};
    Side<typename C::Src> src(w, h, kind, mis, rng);
    Side<typename C::Dst> dst(w, h, kind, (mis * 7 + 3) % 16, rng);
    const auto srcBefore = src.bytes(), dstBefore = dst.bytes();
    SCOPED_TRACE(std::string(name) + " width " + std::to_string(w) + " height " + std::to_string(h) + " step kind " +
                 std::to_string(kind) + " misalign " + std::to_string(mis));
    const zoxStatus st = call<C>(f, src, dst, roi);
    ASSERT_EQ(st, sizeBad<C::sizeClass>(roi) ? zoxStatusBadSize : zoxStatusOk);
    ASSERT_EQ(src.bytes(), srcBefore) << "the source changed";
    const auto got = dst.bytes();
    dst.restore(dstBefore);
    if (st == zoxStatusOk)
        model<C>(src.ordered(), dst.ordered(), roi);
    for (std::size_t p = 0; p < dst.planes.size(); ++p) {
        ASSERT_EQ(dst.planes[p]->firstGuardChange(dstBefore[p]), -1) << "plane " << p << " written outside";
        ASSERT_EQ(got[p], dst.planes[p]->bytes()) << "plane " << p;
    }
}

template <class C, class Fn>
void sweep(const char* name, Fn f)
{
    Rng rng(515);
    for (int w = 1; w <= 70; ++w)
        for (int h = 1; h <= 8; ++h) {
            checkCase<C>(name, f, w, h, (w + h) % 3 == 1 && h > 1 ? 1 : (w + h) % 3 == 2 ? 2 : 0, (w + 5 * h) % 17 - 1, rng);
            if (::testing::Test::HasFatalFailure())
                return;
        }
    // Images above the sizes at which rows stream (a third and a half of a megapixel), odd in both
    // sizes, the region ending at an inaccessible page.
    checkCase<C>(name, f, 1027, 531, 0, -1, rng);
}

// Every pointer first, then the size class (G: its own order); nothing written on failure.
template <class C, class Fn>
void validation(const char* name, Fn f)
{
    Rng rng(3);
    Side<typename C::Src> src(8, 4, 0, 0, rng);
    Side<typename C::Dst> dst(8, 4, 0, 0, rng);
    const auto before = dst.bytes();
    constexpr bool g = C::sizeClass == SizeClass::G;
    const ImageSize sizes[] = {{8, 4}, {1, 4}, {3, 4}, {8, 1}, {8, 0}, {0, 4}, {-1, -1}};
    struct Null {
        int src, dst;
        bool element;
    };
    std::vector<Null> nulls = {{-1, -1, false}, {C::Src::planes == 2 ? 0 : 9, -1, false}, {-1, C::Dst::planes == 2 ? 0 : 9, false}};
    if (C::Src::planes == 2)
        nulls.push_back({1, -1, false});
    if (C::Dst::planes == 2)
        nulls.push_back({-1, 1, false});
    for (int p = 0; p < 3; ++p) {
        if (C::Src::planes == 3)
            nulls.push_back({p, -1, true});
        if (C::Dst::planes == 3)
            nulls.push_back({-1, p, true});
    }
    for (const Null& n : nulls)
        for (const ImageSize roi : sizes) {
            const bool isNull = n.src >= 0 || n.dst >= 0;
            zoxStatus want = sizeBad<C::sizeClass>(roi) ? zoxStatusBadSize : zoxStatusOk;
            if (isNull)
                want = g && n.element && (roi.width < 1 || roi.height < 1) ? zoxStatusBadSize : zoxStatusNullPointer;
            if (want == zoxStatusOk)
                continue;
            SCOPED_TRACE(std::string(name) + " null " + std::to_string(n.src) + "/" + std::to_string(n.dst) + " size " +
                         std::to_string(roi.width) + "x" + std::to_string(roi.height));
            const zoxStatus st = call<C>(f, src, dst, roi, n.src, n.dst);
            EXPECT_EQ(st, want);
            EXPECT_EQ(dst.bytes(), before) << "written before validation passed";
        }
}

#define ZT_REPACK_SWEEP(name, shape, Src, Dst, Rule, Class, Stream) \
    TEST(RepackSweep, name) { sweep<ZOX_REPACK(Src, Dst, Rule, Class, Stream)>(#name, &name); }
ZOX_REPACK_TABLE(ZT_REPACK_SWEEP)

#define ZT_REPACK_VALIDATION(name, shape, Src, Dst, Rule, Class, Stream) \
    TEST(RepackValidation, name) { validation<ZOX_REPACK(Src, Dst, Rule, Class, Stream)>(#name, &name); }
ZOX_REPACK_TABLE(ZT_REPACK_VALIDATION)

} // namespace

namespace {

std::vector<uint8_t> bytes(std::size_t n, unsigned seed)
{
    std::vector<uint8_t> v(n);
    Rng rng(seed);
    for (auto& b : v)
        b = static_cast<uint8_t>(rng());
    return v;
}

// 4:1:1 folded into 4:2:0 and unfolded again gives every sample back, and so does 4:2:2 through groups.
TEST(Repack, RoundTripsGiveEverySampleBack)
{
    const int w = 24, h = 6;
    auto y = bytes(w * h, 1), cb = bytes(w / 4 * h, 2), cr = bytes(w / 4 * h, 3);
    const uint8_t* src[3] = {y.data(), cb.data(), cr.data()};
    const int steps411[3] = {w, w / 4, w / 4};
    std::vector<uint8_t> y420(w * h), c420(w / 2 * h / 2 * 2), y2(w * h), p2(w / 2 * h / 2 * 2), cb2(w / 4 * h), cr2(w / 4 * h);
    uint8_t* d420[3] = {y420.data(), c420.data(), c420.data() + w / 2 * h / 2};
    const int steps420[3] = {w, w / 2, w / 2};
    ASSERT_EQ(zoxiYCbCr411ToYCbCr420_8u_P3R(src, steps411, d420, steps420, {w, h}), zoxStatusOk);
    const uint8_t* s420[3] = {d420[0], d420[1], d420[2]};
    ASSERT_EQ(zoxiYCbCr420ToYCbCr411_8u_P3P2R(s420, steps420, y2.data(), w, p2.data(), w / 2, {w, h}), zoxStatusOk);
    uint8_t* back[3] = {y2.data(), cb2.data(), cr2.data()};
    std::vector<uint8_t> yBack(w * h);
    back[0] = yBack.data();
    ASSERT_EQ(zoxiYCbCr411_8u_P2P3R(y2.data(), w, p2.data(), w / 2, back, steps411, {w, h}), zoxStatusOk);
    EXPECT_EQ(yBack, y);
    EXPECT_EQ(cb2, cb);
    EXPECT_EQ(cr2, cr);

    auto cb422 = bytes(w / 2 * h, 4), cr422 = bytes(w / 2 * h, 5);
    const uint8_t* s422[3] = {y.data(), cb422.data(), cr422.data()};
    const int steps422[3] = {w, w / 2, w / 2};
    std::vector<uint8_t> groups(2 * w * h), yy(w * h), bb(w / 2 * h), rr(w / 2 * h);
    ASSERT_EQ(zoxiYCbCr422ToCbYCr422_8u_P3C2R(s422, steps422, groups.data(), 2 * w, {w, h}), zoxStatusOk);
    uint8_t* d422[3] = {yy.data(), bb.data(), rr.data()};
    ASSERT_EQ(zoxiCbYCr422ToYCbCr422_8u_C2P3R(groups.data(), 2 * w, d422, steps422, {w, h}), zoxStatusOk);
    EXPECT_EQ(yy, y);
    EXPECT_EQ(bb, cb422);
    EXPECT_EQ(rr, cr422);
}

// Heights the 4:1:1 members do not look at, and the one 4:1:1 member that does.
TEST(Repack, HeightChecksByClass)
{
    std::vector<uint8_t> in(64), y(64), cb(16), cr(16);
    uint8_t* d[3] = {y.data(), cb.data(), cr.data()};
    const int steps[3] = {8, 2, 2};
    EXPECT_EQ(zoxiCbYCr422ToYCbCr411_8u_C2P3R(in.data(), 16, d, steps, {3, 2}), zoxStatusBadSize);
    EXPECT_EQ(zoxiCbYCr422ToYCbCr411_8u_C2P3R(in.data(), 16, d, steps, {4, 0}), zoxStatusOk);
    EXPECT_EQ(zoxiYCbCr422ToYCbCr411_8u_C2P3R(in.data(), 16, d, steps, {4, 0}), zoxStatusBadSize);
}

} // namespace
