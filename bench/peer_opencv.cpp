// Nearest calls of OpenCV's imgproc, where its development packages are installed: cv::cvtColor on
// packed 8-bit three-channel images, on one thread, timed beside ours only.
#include "bench.hpp"

#if defined(ZOX_BENCH_OPENCV)
#include <opencv2/core.hpp>
#include <opencv2/imgproc.hpp>

#include <cstring>

namespace zb {
namespace {

// type: the source's; dstType: the destination's where it differs (bytes counted from both).
void registerCvtColor(const std::string& name, int code, const std::string& ours, int type = CV_8UC3, int dstType = -1)
{
    const std::size_t sample = type == CV_32FC3 ? 4 : 1;
    if (dstType < 0)
        dstType = type;
    for (Size size : kSizes) {
        const std::size_t px = static_cast<std::size_t>(size.width) * size.height;
        const std::size_t bytes = px * (CV_ELEM_SIZE(type) + CV_ELEM_SIZE(dstType));
        registerPeer("OpenCV " + name, {ours}, size, bytes, [code, type, dstType, sample](Size s) -> Call {
            auto src = std::make_shared<cv::Mat>(s.height, s.width, type);
            const std::size_t n = std::size_t(s.width) * s.height * CV_ELEM_SIZE(type) / sample;
            const std::vector<uint8_t> bytes = randomBytes(n);
            if (type == CV_32FC3)
                for (std::size_t i = 0; i < n; ++i)
                    reinterpret_cast<float*>(src->data)[i] = bytes[i] / 255.0f;
            else
                std::memcpy(src->data, bytes.data(), n * sample);
            // Allocated here with the size and type cvtColor asks for, so the timed call only converts.
            auto dst = std::make_shared<cv::Mat>(s.height, s.width, dstType);
            return [src, dst, code] { cv::cvtColor(*src, *dst, code); };
        });
    }
}

// cvtColor to one channel, and cv::transform with a 3x4 matrix, at 8u and 32f.
void registerGrayAndTransform()
{
    for (Size size : kSizes) {
        const std::size_t px = static_cast<std::size_t>(size.width) * size.height;
        registerPeer("OpenCV RGB2GRAY", {"zoxiRGBToGray_8u_C3C1R"}, size, px * 4, [](Size s) -> Call {
            auto src = std::make_shared<cv::Mat>(s.height, s.width, CV_8UC3);
            const std::vector<uint8_t> bytes = randomBytes(std::size_t(s.width) * s.height * 3);
            std::memcpy(src->data, bytes.data(), bytes.size());
            auto dst = std::make_shared<cv::Mat>(s.height, s.width, CV_8UC1);
            return [src, dst] { cv::cvtColor(*src, *dst, cv::COLOR_RGB2GRAY); };
        });
        for (int type : {CV_8UC3, CV_32FC3}) {
            const std::size_t sample = type == CV_32FC3 ? 4 : 1;
            const char* ours = type == CV_32FC3 ? "zoxiColorTwist_32f_C3R" : "zoxiColorTwist32f_8u_C3R";
            registerPeer(type == CV_32FC3 ? "OpenCV transform 32f" : "OpenCV transform 8u", {ours}, size, px * 6 * sample,
                         [type](Size s) -> Call {
                             auto src = std::make_shared<cv::Mat>(s.height, s.width, type);
                             const std::size_t n = std::size_t(s.width) * s.height * 3;
                             const std::vector<uint8_t> bytes = randomBytes(n);
                             for (std::size_t i = 0; i < n; ++i) {
                                 if (type == CV_32FC3)
                                     reinterpret_cast<float*>(src->data)[i] = bytes[i] / 255.0f;
                                 else
                                     src->data[i] = bytes[i];
                             }
                             auto dst = std::make_shared<cv::Mat>(s.height, s.width, type);
                             auto m = std::make_shared<cv::Mat>(cv::Mat_<float>({3, 4}, {0.9f, 0.1f, 0.05f, 2, 0.05f, 0.8f, 0.1f, 1, 0.1f, 0.05f, 0.9f, -3}));
                             return [src, dst, m] { cv::transform(*src, *dst, *m); };
                         });
        }
    }
}

} // namespace

void registerOpenCVPeers()
{
    cv::setNumThreads(1);
    registerCvtColor("RGB2YUV", cv::COLOR_RGB2YUV, "zoxiRGBToYUV_8u_C3R");
    registerCvtColor("YUV2RGB", cv::COLOR_YUV2RGB, "zoxiYUVToRGB_8u_C3R");
    registerCvtColor("RGB2YCrCb", cv::COLOR_RGB2YCrCb, "zoxiRGBToYCbCr_8u_C3R");
    registerCvtColor("YCrCb2RGB", cv::COLOR_YCrCb2RGB, "zoxiYCbCrToRGB_8u_C3R");
    registerCvtColor("RGB2XYZ", cv::COLOR_RGB2XYZ, "zoxiRGBToXYZ_8u_C3R");
    registerCvtColor("XYZ2RGB", cv::COLOR_XYZ2RGB, "zoxiXYZToRGB_8u_C3R");
    registerCvtColor("RGB2XYZ 32f", cv::COLOR_RGB2XYZ, "zoxiRGBToXYZ_32f_C3R", CV_32FC3);
    registerCvtColor("XYZ2RGB 32f", cv::COLOR_XYZ2RGB, "zoxiXYZToRGB_32f_C3R", CV_32FC3);
    registerCvtColor("BGR2BGR565", cv::COLOR_BGR2BGR565, "zoxiBGRToBGR565_8u16u_C3R", CV_8UC3, CV_8UC2);
    registerCvtColor("BGR5652BGR", cv::COLOR_BGR5652BGR, "zoxiBGR565ToBGR_16u8u_C3R", CV_8UC2, CV_8UC3);
    registerGrayAndTransform();
}
} // namespace zb
#else
namespace zb {
void registerOpenCVPeers() {}
} // namespace zb
#endif
