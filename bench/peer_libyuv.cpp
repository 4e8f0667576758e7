// Nearest calls of libyuv, where its development package is installed: timed beside ours only.
// libyuv has no packed three-byte YUV, so its 4:4:4 planes stand in for our packed and planar forms.
#include "bench.hpp"

#if defined(ZOX_BENCH_LIBYUV)
#include <libyuv.h>

#include <string>

namespace zb {
namespace {

// Three planes of one image in one buffer.
struct Planes {
    std::vector<uint8_t> bytes;
    std::size_t plane;
    Planes(Size s, bool random)
        : bytes(random ? randomBytes(std::size_t(s.width) * s.height * 3) : std::vector<uint8_t>(std::size_t(s.width) * s.height * 3)),
          plane(std::size_t(s.width) * s.height)
    {
    }
    uint8_t* operator[](int p) { return bytes.data() + p * plane; }
};


// One sampled conversion of libyuv from a packed source of `bpp` bytes a pixel.
void samplePeer(const char* name, std::vector<std::string> ours, Size size, int bpp, std::size_t outBytes,
                void (*call)(const uint8_t*, int, uint8_t*, Size))
{
    const std::size_t px = static_cast<std::size_t>(size.width) * size.height;
    registerPeer(name, ours, size, px * bpp + outBytes, [bpp, outBytes, call](Size s) -> Call {
        auto in = std::make_shared<std::vector<uint8_t>>(randomBytes(std::size_t(s.width) * s.height * bpp));
        auto out = std::make_shared<std::vector<uint8_t>>(outBytes + 64);
        return [in, out, s, bpp, call] { call(in->data(), s.width * bpp, out->data(), s); };
    });
}

// One conversion of libyuv from a sampled image of `inBytes` to a packed destination of `outBytes`.
void unsamplePeer(const char* name, std::vector<std::string> ours, Size size, std::size_t inBytes, std::size_t outBytes,
                  void (*call)(const uint8_t*, uint8_t*, Size))
{
    registerPeer(name, ours, size, inBytes + outBytes, [inBytes, outBytes, call](Size s) -> Call {
        auto in = std::make_shared<std::vector<uint8_t>>(randomBytes(inBytes + 64));
        auto out = std::make_shared<std::vector<uint8_t>>(outBytes + 64);
        return [in, out, s, call] { call(in->data(), out->data(), s); };
    });
}

} // namespace

void registerLibyuvPeers()
{
    // The SSE4.1-only build is timed against libyuv held to the same generation of instructions.
    if (std::string(ZOX_BENCH_ISA) == "sse41")
        libyuv::MaskCpuFlags(libyuv::kCpuHasX86 | libyuv::kCpuHasSSE2 | libyuv::kCpuHasSSSE3 | libyuv::kCpuHasSSE41 |
                             libyuv::kCpuHasSSE42);
    for (Size size : kSizes) {
        const std::size_t q = static_cast<std::size_t>(size.width / 2) * (size.height / 2);
        const std::size_t luma = static_cast<std::size_t>(size.width) * size.height;
        // 4:2:0 planes, two rows at a time: I420 (three planes) and NV12 (Y and pairs) out.
        samplePeer("libyuv RGB24ToI420", {"zoxiRGBToYCbCr420_8u_C3P3R", "zoxiRGBToYUV420_8u_C3P3R"}, size, 3, luma + 2 * q,
                   [](const uint8_t* in, int step, uint8_t* o, Size s) {
                       const int w = s.width, h = s.height;
                       libyuv::RGB24ToI420(in, step, o, w, o + w * h, w / 2, o + w * h + w / 2 * (h / 2), w / 2, w, h);
                   });
        samplePeer("libyuv ARGBToI420", {"zoxiBGRToYCbCr420_8u_AC4P3R"}, size, 4, luma + 2 * q,
                   [](const uint8_t* in, int step, uint8_t* o, Size s) {
                       const int w = s.width, h = s.height;
                       libyuv::ARGBToI420(in, step, o, w, o + w * h, w / 2, o + w * h + w / 2 * (h / 2), w / 2, w, h);
                   });
        samplePeer("libyuv ARGBToNV12", {"zoxiRGBToYCbCr420_8u_C3P2R"}, size, 4, luma + 2 * q,
                   [](const uint8_t* in, int step, uint8_t* o, Size s) {
                       const int w = s.width, h = s.height;
                       libyuv::ARGBToNV12(in, step, o, w, o + w * h, w, w, h);
                   });
        samplePeer("libyuv RGB565ToI420", {"zoxiRGB565ToYUV420_16u8u_C3P3R", "zoxiBGR565ToYCbCr420_16u8u_C3P3R"}, size, 2,
                   luma + 2 * q, [](const uint8_t* in, int step, uint8_t* o, Size s) {
                       const int w = s.width, h = s.height;
                       libyuv::RGB565ToI420(in, step, o, w, o + w * h, w / 2, o + w * h + w / 2 * (h / 2), w / 2, w, h);
                   });
        samplePeer("libyuv ARGBToYUY2", {"zoxiRGBToYCbCr422_8u_C3C2R"}, size, 4, 2 * luma,
                   [](const uint8_t* in, int step, uint8_t* o, Size s) {
                       libyuv::ARGBToYUY2(in, step, o, s.width * 2, s.width, s.height);
                   });
    }
    for (Size size : kSizes) {
        const std::size_t luma = static_cast<std::size_t>(size.width) * size.height;
        const std::size_t q = static_cast<std::size_t>(size.width / 2) * (size.height / 2), half = luma / 2;
        // From 4:2:0 planes, Y and pairs, 4:2:2 planes and YUY2 groups.
        unsamplePeer("libyuv I420ToRGB24", {"zoxiYCbCr420ToRGB_8u_P3C3R", "zoxiYUV420ToRGB_8u_P3C3R"}, size, luma + 2 * q, 3 * luma,
                     [](const uint8_t* in, uint8_t* o, Size s) {
                         const int w = s.width, h = s.height;
                         libyuv::I420ToRGB24(in, w, in + w * h, w / 2, in + w * h + w / 2 * (h / 2), w / 2, o, 3 * w, w, h);
                     });
        unsamplePeer("libyuv NV12ToARGB", {"zoxiYCbCr420ToBGR_8u_P2C4R"}, size, luma + 2 * q, 4 * luma,
                     [](const uint8_t* in, uint8_t* o, Size s) {
                         const int w = s.width, h = s.height;
                         libyuv::NV12ToARGB(in, w, in + w * h, w, o, 4 * w, w, h);
                     });
        unsamplePeer("libyuv I422ToRGB24", {"zoxiYCbCr422ToRGB_8u_P3C3R"}, size, luma + 2 * half, 3 * luma,
                     [](const uint8_t* in, uint8_t* o, Size s) {
                         const int w = s.width, h = s.height;
                         libyuv::I422ToRGB24(in, w, in + w * h, w / 2, in + w * h + w / 2 * h, w / 2, o, 3 * w, w, h);
                     });
        // Sixteen-bit words: 4:2:0 planes in, plain and dithered; words to and from pixels.
        unsamplePeer("libyuv I420ToRGB565", {"zoxiYCbCr420ToBGR565_8u16u_P3C3R", "zoxiYUV420ToRGB565_8u16u_P3C3R"}, size,
                     luma + 2 * q, 2 * luma, [](const uint8_t* in, uint8_t* o, Size s) {
                         const int w = s.width, h = s.height;
                         libyuv::I420ToRGB565(in, w, in + w * h, w / 2, in + w * h + w / 2 * (h / 2), w / 2, o, 2 * w, w, h);
                     });
        unsamplePeer("libyuv I420ToRGB565Dither", {"zoxiYCbCr420ToBGR565Dither_8u16u_P3C3R"}, size, luma + 2 * q, 2 * luma,
                     [](const uint8_t* in, uint8_t* o, Size s) {
                         const int w = s.width, h = s.height;
                         libyuv::I420ToRGB565Dither(in, w, in + w * h, w / 2, in + w * h + w / 2 * (h / 2), w / 2, o, 2 * w, nullptr, w, h);
                     });
        unsamplePeer("libyuv ARGBToRGB565", {"zoxiBGRToBGR565_8u16u_C3R"}, size, 4 * luma, 2 * luma,
                     [](const uint8_t* in, uint8_t* o, Size s) { libyuv::ARGBToRGB565(in, 4 * s.width, o, 2 * s.width, s.width, s.height); });
        unsamplePeer("libyuv RGB565ToARGB", {"zoxiBGR565ToBGR_16u8u_C3R"}, size, 2 * luma, 4 * luma,
                     [](const uint8_t* in, uint8_t* o, Size s) { libyuv::RGB565ToARGB(in, 2 * s.width, o, 4 * s.width, s.width, s.height); });
        // Repacking.
        unsamplePeer("libyuv NV12ToI420", {"zoxiYCbCr420_8u_P2P3R"}, size, luma + 2 * q, luma + 2 * q,
                     [](const uint8_t* in, uint8_t* o, Size s) {
                         const int w = s.width, h = s.height;
                         libyuv::NV12ToI420(in, w, in + w * h, w, o, w, o + w * h, w / 2, o + w * h + w / 2 * (h / 2), w / 2, w, h);
                     });
        unsamplePeer("libyuv I420ToNV12", {"zoxiYCbCr420_8u_P3P2R"}, size, luma + 2 * q, luma + 2 * q,
                     [](const uint8_t* in, uint8_t* o, Size s) {
                         const int w = s.width, h = s.height;
                         libyuv::I420ToNV12(in, w, in + w * h, w / 2, in + w * h + w / 2 * (h / 2), w / 2, o, w, o + w * h, w, w, h);
                     });
        unsamplePeer("libyuv YUY2ToI420", {"zoxiYCbCr422ToYCbCr420_8u_C2P3R"}, size, 2 * luma, luma + 2 * q,
                     [](const uint8_t* in, uint8_t* o, Size s) {
                         const int w = s.width, h = s.height;
                         libyuv::YUY2ToI420(in, 2 * w, o, w, o + w * h, w / 2, o + w * h + w / 2 * (h / 2), w / 2, w, h);
                     });
        unsamplePeer("libyuv I422ToYUY2", {"zoxiYCbCr422_8u_P3C2R"}, size, luma + 2 * half, 2 * luma,
                     [](const uint8_t* in, uint8_t* o, Size s) {
                         const int w = s.width, h = s.height;
                         libyuv::I422ToYUY2(in, w, in + w * h, w / 2, in + w * h + w / 2 * h, w / 2, o, 2 * w, w, h);
                     });
        unsamplePeer("libyuv I420ToUYVY", {"zoxiYCrCb420ToCbYCr422_8u_P3C2R"}, size, luma + 2 * q, 2 * luma,
                     [](const uint8_t* in, uint8_t* o, Size s) {
                         const int w = s.width, h = s.height;
                         libyuv::I420ToUYVY(in, w, in + w * h, w / 2, in + w * h + w / 2 * (h / 2), w / 2, o, 2 * w, w, h);
                     });
        unsamplePeer("libyuv RGB24ToJ400", {"zoxiRGBToGray_8u_C3C1R"}, size, 3 * luma, luma,
                     [](const uint8_t* in, uint8_t* o, Size s) { libyuv::RGB24ToJ400(in, 3 * s.width, o, s.width, s.width, s.height); });
        unsamplePeer("libyuv YUY2ToARGB", {"zoxiYCbCr422ToRGB_8u_C2C3R"}, size, 2 * luma, 4 * luma,
                     [](const uint8_t* in, uint8_t* o, Size s) { libyuv::YUY2ToARGB(in, 2 * s.width, o, 4 * s.width, s.width, s.height); });
    }
    for (Size size : kSizes) {
        const std::size_t px = static_cast<std::size_t>(size.width) * size.height;
        // 4:4:4 planes from ARGB (4 bytes in, 3 out).
        registerPeer("libyuv ARGBToI444", {"zoxiRGBToYUV_8u_C3R", "zoxiRGBToYCbCr_8u_C3P3R"}, size, px * 7, [](Size s) -> Call {
            auto argb = std::make_shared<std::vector<uint8_t>>(randomBytes(std::size_t(s.width) * s.height * 4));
            auto out = std::make_shared<Planes>(s, false);
            return [argb, out, s] {
                libyuv::ARGBToI444(argb->data(), s.width * 4, (*out)[0], s.width, (*out)[1], s.width, (*out)[2], s.width,
                                   s.width, s.height);
            };
        });
        // ARGB from 4:4:4 planes.
        registerPeer("libyuv I444ToARGB", {"zoxiYUVToRGB_8u_C3R", "zoxiYCbCrToRGB_8u_P3C4R"}, size, px * 7, [](Size s) -> Call {
            auto in = std::make_shared<Planes>(s, true);
            auto argb = std::make_shared<std::vector<uint8_t>>(std::size_t(s.width) * s.height * 4);
            return [in, argb, s] {
                libyuv::I444ToARGB((*in)[0], s.width, (*in)[1], s.width, (*in)[2], s.width, argb->data(), s.width * 4,
                                   s.width, s.height);
            };
        });
        // Three-byte RGB from 4:4:4 planes.
        registerPeer("libyuv I444ToRGB24", {"zoxiYUVToRGB_8u_P3C3R"}, size, px * 6, [](Size s) -> Call {
            auto in = std::make_shared<Planes>(s, true);
            auto rgb = std::make_shared<std::vector<uint8_t>>(std::size_t(s.width) * s.height * 3);
            return [in, rgb, s] {
                libyuv::I444ToRGB24((*in)[0], s.width, (*in)[1], s.width, (*in)[2], s.width, rgb->data(), s.width * 3,
                                    s.width, s.height);
            };
        });
    }
}
} // namespace zb
#else
namespace zb {
void registerLibyuvPeers() {}
} // namespace zb
#endif
