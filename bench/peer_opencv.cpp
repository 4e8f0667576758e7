// Nearest calls of OpenCV's imgproc, where its development packages are installed: cv::cvtColor on
// packed 8-bit three-channel images, on one thread, timed beside ours only.
#include "bench.hpp"

#if defined(ZOX_BENCH_OPENCV)
#include <opencv2/core.hpp>
#include <opencv2/imgproc.hpp>

#include <cstring>

namespace zb {
namespace {

void registerCvtColor(const std::string& name, int code, const std::string& ours)
{
    for (Size size : kSizes) {
        const std::size_t px = static_cast<std::size_t>(size.width) * size.height;
        registerPeer("OpenCV " + name, {ours}, size, px * 6, [code](Size s) -> Call {
            auto src = std::make_shared<cv::Mat>(s.height, s.width, CV_8UC3);
            const std::vector<uint8_t> bytes = randomBytes(std::size_t(s.width) * s.height * 3);
            std::memcpy(src->data, bytes.data(), bytes.size());
            // Allocated here with the size and type cvtColor asks for, so the timed call only converts.
            auto dst = std::make_shared<cv::Mat>(s.height, s.width, CV_8UC3);
            return [src, dst, code] { cv::cvtColor(*src, *dst, code); };
        });
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
}
} // namespace zb
#else
namespace zb {
void registerOpenCVPeers() {}
} // namespace zb
#endif
