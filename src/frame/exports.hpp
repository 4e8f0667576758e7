// Every family table, for the expansions that walk all exports (the name list, tests, benchmarks, tool).
#pragma once

#include "lumachroma/xyzycc_table.hpp"
#include "lumachroma/ycbcr_table.hpp"
#include "lumachroma/yuv_table.hpp"
#include "packed/words_sampled_table.hpp"
#include "packed/words_table.hpp"
#include "packed/words_tosampled_table.hpp"
#include "pointops/gamma_table.hpp"
#include "pointops/gray_table.hpp"
#include "pointops/twist_table.hpp"
#include "sampling/fromsampled_table.hpp"
#include "sampling/repack_table.hpp"
#include "sampling/tosampled_table.hpp"
#include "tonemap/tonemap_table.hpp"
#include "ycocg/ycocg_table.hpp"

// Apply X to every row of every generic-conversion family.
#define ZOX_CONV_TABLES(X) ZOX_YUV_TABLE(X) ZOX_YCBCR_TABLE(X) ZOX_YCOCG_TABLE(X) ZOX_XYZYCC_TABLE(X) ZOX_WORDS_TABLE(X)

// Apply X to every export row of every family (the first argument of each row is the export name).
#define ZOX_ALL_EXPORTS(X) ZOX_CONV_TABLES(X) ZOX_GAMMA_TABLE(X) ZOX_TONEMAP_TABLE(X) ZOX_TO_SAMPLED_TABLE(X) ZOX_WORDS_TO_SAMPLED_TABLE(X) ZOX_FROM_SAMPLED_TABLE(X) ZOX_WORDS_SAMPLED_TABLE(X) ZOX_REPACK_TABLE(X) \
    ZOX_TWIST_TABLE(X) ZOX_GRAY_TABLE(X)
