// Repacking among chroma samplings, layouts and chroma orders: one row an export.
//   X(name, shape, source format, destination format, chroma rule, size class, stream luma above)
// The last column: the luma rows (and the chroma rows of plain plane copies) go through the row copy
// with streaming stores when the region has more pixels than this; 0: never.
// zoxiYCbCr420ToYCrCb420_8u_P2P3R writes the pairs' first bytes to its second plane, as
// zoxiYCbCr420_8u_P2P3R does; the two differ only in their checks.
#pragma once

#include "sampling/repack.hpp"

namespace zox {

using RepackGCbYCr = FmtGroups<CbYCrY>;
using RepackGYCbCr = FmtGroups<YCbYCr>;
using RepackGYCrCb = FmtGroups<YCrYCb>;
using RepackP411 = FmtPlanes<Sampling::S411>;
using RepackP420 = FmtPlanes<Sampling::S420>;
using RepackP422 = FmtPlanes<Sampling::S422>;
using RepackP420Cr = FmtPlanes<Sampling::S420, true>;
using RepackP422Cr = FmtPlanes<Sampling::S422, true>;
using RepackQ411 = FmtPairs<Sampling::S411>;
using RepackQ420 = FmtPairs<Sampling::S420>;

} // namespace zox

#define ZOX_REPACK_TABLE(X) \
    X(zoxiCbYCr422ToYCbCr411_8u_C2P3R, ZOX_SHAPE_REPACK_C2P3, RepackGCbYCr, RepackP411, SampleDrop, E, 0) \
    X(zoxiCbYCr422ToYCbCr420_8u_C2P2R, ZOX_SHAPE_REPACK_C2P2, RepackGCbYCr, RepackQ420, RowDrop, A, 0) \
    X(zoxiCbYCr422ToYCbCr420_8u_C2P3R, ZOX_SHAPE_REPACK_C2P3, RepackGCbYCr, RepackP420, RowDrop, A, 0) \
    X(zoxiCbYCr422ToYCbCr422_8u_C2P3R, ZOX_SHAPE_REPACK_C2P3, RepackGCbYCr, RepackP422, Copy, C, 0) \
    X(zoxiCbYCr422ToYCbCr422_8u_C2R, ZOX_SHAPE_REPACK_C2C2, RepackGCbYCr, RepackGYCbCr, Copy, C, 0) \
    X(zoxiCbYCr422ToYCrCb420_8u_C2P3R, ZOX_SHAPE_REPACK_C2P3, RepackGCbYCr, RepackP420Cr, RowDrop, A, 0) \
    X(zoxiYCbCr411ToYCbCr420_8u_P2P3R, ZOX_SHAPE_REPACK_P2P3, RepackQ411, RepackP420, RowFold, B, 0) \
    X(zoxiYCbCr411ToYCbCr420_8u_P3P2R, ZOX_SHAPE_REPACK_P3P2, RepackP411, RepackQ420, RowFold, B, 348602) \
    X(zoxiYCbCr411ToYCbCr420_8u_P3R, ZOX_SHAPE_REPACK_P3P3, RepackP411, RepackP420, RowFold, B, 0) \
    X(zoxiYCbCr411ToYCrCb420_8u_P2P3R, ZOX_SHAPE_REPACK_P2P3, RepackQ411, RepackP420Cr, RowFold, B, 0) \
    X(zoxiYCbCr411ToYCbCr422_8u_P2C2R, ZOX_SHAPE_REPACK_P2C2, RepackQ411, RepackGYCbCr, SampleRepeat, E, 0) \
    X(zoxiYCbCr411ToYCbCr422_8u_P2P3R, ZOX_SHAPE_REPACK_P2P3, RepackQ411, RepackP422, SampleRepeat, E, 348602) \
    X(zoxiYCbCr411ToYCbCr422_8u_P3C2R, ZOX_SHAPE_REPACK_P3C2, RepackP411, RepackGYCbCr, SampleRepeat, E, 0) \
    X(zoxiYCbCr411ToYCbCr422_8u_P3R, ZOX_SHAPE_REPACK_P3P3, RepackP411, RepackP422, SampleRepeat, E, 0) \
    X(zoxiYCbCr411ToYCrCb422_8u_P3C2R, ZOX_SHAPE_REPACK_P3C2, RepackP411, RepackGYCrCb, SampleRepeat, E, 0) \
    X(zoxiYCbCr411ToYCrCb422_8u_P3R, ZOX_SHAPE_REPACK_P3P3, RepackP411, RepackP422Cr, SampleRepeat, E, 0) \
    X(zoxiYCbCr411_8u_P2P3R, ZOX_SHAPE_REPACK_P2P3, RepackQ411, RepackP411, Copy, E, 0) \
    X(zoxiYCbCr411_8u_P3P2R, ZOX_SHAPE_REPACK_P3P2, RepackP411, RepackQ411, Copy, E, 348602) \
    X(zoxiYCbCr420ToCbYCr422_8u_P2C2R, ZOX_SHAPE_REPACK_P2C2, RepackQ420, RepackGCbYCr, RowRepeat, A, 0) \
    X(zoxiYCbCr420ToYCbCr411_8u_P2P3R, ZOX_SHAPE_REPACK_P2P3, RepackQ420, RepackP411, RowUnfold, B, 0) \
    X(zoxiYCbCr420ToYCbCr411_8u_P3P2R, ZOX_SHAPE_REPACK_P3P2, RepackP420, RepackQ411, RowUnfold, B, 0) \
    X(zoxiYCrCb420ToYCbCr411_8u_P3P2R, ZOX_SHAPE_REPACK_P3P2, RepackP420Cr, RepackQ411, RowUnfold, B, 0) \
    X(zoxiYCbCr420ToYCbCr422_8u_P2C2R, ZOX_SHAPE_REPACK_P2C2, RepackQ420, RepackGYCbCr, RowRepeat, A, 0) \
    X(zoxiYCbCr420ToYCbCr422_8u_P2P3R, ZOX_SHAPE_REPACK_P2P3, RepackQ420, RepackP422, RowRepeat, A, 0) \
    X(zoxiYCbCr420ToYCbCr422_8u_P3R, ZOX_SHAPE_REPACK_P3P3, RepackP420, RepackP422, RowRepeat, A, 0) \
    X(zoxiYCbCr420ToYCrCb420_8u_P2P3R, ZOX_SHAPE_REPACK_P2P3, RepackQ420, RepackP420, Copy, G, 0) \
    X(zoxiYCbCr420_8u_P2P3R, ZOX_SHAPE_REPACK_P2P3, RepackQ420, RepackP420, Copy, A, 0) \
    X(zoxiYCbCr420_8u_P3P2R, ZOX_SHAPE_REPACK_P3P2, RepackP420, RepackQ420, Copy, A, 0) \
    X(zoxiYCbCr422ToCbYCr422_8u_C2R, ZOX_SHAPE_REPACK_C2C2, RepackGYCbCr, RepackGCbYCr, Copy, C, 0) \
    X(zoxiYCbCr422ToCbYCr422_8u_P3C2R, ZOX_SHAPE_REPACK_P3C2, RepackP422, RepackGCbYCr, Copy, C, 0) \
    X(zoxiYCbCr422ToYCbCr411_8u_C2P2R, ZOX_SHAPE_REPACK_C2P2, RepackGYCbCr, RepackQ411, SampleDrop, E, 0) \
    X(zoxiYCbCr422ToYCbCr411_8u_C2P3R, ZOX_SHAPE_REPACK_C2P3, RepackGYCbCr, RepackP411, SampleDrop, D, 0) \
    X(zoxiYCbCr422ToYCbCr411_8u_P3P2R, ZOX_SHAPE_REPACK_P3P2, RepackP422, RepackQ411, SampleDrop, E, 0) \
    X(zoxiYCbCr422ToYCbCr411_8u_P3R, ZOX_SHAPE_REPACK_P3P3, RepackP422, RepackP411, SampleDrop, E, 524288) \
    X(zoxiYCbCr422ToYCbCr420_8u_C2P2R, ZOX_SHAPE_REPACK_C2P2, RepackGYCbCr, RepackQ420, RowDrop, A, 0) \
    X(zoxiYCbCr422ToYCbCr420_8u_C2P3R, ZOX_SHAPE_REPACK_C2P3, RepackGYCbCr, RepackP420, RowDrop, A, 0) \
    X(zoxiYCbCr422ToYCbCr420_8u_P3P2R, ZOX_SHAPE_REPACK_P3P2, RepackP422, RepackQ420, RowDrop, A, 0) \
    X(zoxiYCbCr422ToYCbCr420_8u_P3R, ZOX_SHAPE_REPACK_P3P3, RepackP422, RepackP420, RowDrop, A, 348602) \
    X(zoxiYCbCr422ToYCrCb420_8u_C2P3R, ZOX_SHAPE_REPACK_C2P3, RepackGYCbCr, RepackP420Cr, RowDrop, A, 0) \
    X(zoxiYCbCr422ToYCrCb422_8u_C2R, ZOX_SHAPE_REPACK_C2C2, RepackGYCbCr, RepackGYCrCb, Copy, F, 0) \
    X(zoxiYCbCr422ToYCrCb422_8u_P3C2R, ZOX_SHAPE_REPACK_P3C2, RepackP422, RepackGYCrCb, Copy, F, 0) \
    X(zoxiYCbCr422_8u_C2P3R, ZOX_SHAPE_REPACK_C2P3, RepackGYCbCr, RepackP422, Copy, C, 0) \
    X(zoxiYCbCr422_8u_P3C2R, ZOX_SHAPE_REPACK_P3C2, RepackP422, RepackGYCbCr, Copy, C, 0) \
    X(zoxiYCrCb420ToCbYCr422_8u_P3C2R, ZOX_SHAPE_REPACK_P3C2, RepackP420Cr, RepackGCbYCr, RowRepeat, A, 0) \
    X(zoxiYCrCb420ToYCbCr420_8u_P3P2R, ZOX_SHAPE_REPACK_P3P2, RepackP420Cr, RepackQ420, Copy, A, 0) \
    X(zoxiYCrCb420ToYCbCr422_8u_P3C2R, ZOX_SHAPE_REPACK_P3C2, RepackP420Cr, RepackGYCbCr, RowRepeat, A, 0) \
    X(zoxiYCrCb420ToYCbCr422_8u_P3R, ZOX_SHAPE_REPACK_P3P3, RepackP420Cr, RepackP422, RowRepeat, A, 0) \
    X(zoxiYCrCb422ToYCbCr411_8u_C2P3R, ZOX_SHAPE_REPACK_C2P3, RepackGYCrCb, RepackP411, SampleDrop, E, 0) \
    X(zoxiYCrCb422ToYCbCr420_8u_C2P3R, ZOX_SHAPE_REPACK_C2P3, RepackGYCrCb, RepackP420, RowDrop, A, 0) \
    X(zoxiYCrCb422ToYCbCr422_8u_C2P3R, ZOX_SHAPE_REPACK_C2P3, RepackGYCrCb, RepackP422, Copy, C, 0)
