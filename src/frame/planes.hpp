// Byte-moving routines shared by the families that pass planes through or fill them: a row copy, a
// plane copy, a row fill and a plane fill. Every route gives the bytes of a plain copy or fill; the
// routes differ in how they move them (non-temporal stores on large images, loads chosen by the
// source's alignment, rows run backwards where the page offsets would make the loads wait on the
// stores). Source and destination never overlap.
#pragma once

#include "zoxcc.h"

#include <cstddef>
#include <cstdint>

namespace zox {

// Copies one row of `length` bytes; `streaming` writes it with non-temporal stores (unless the
// distance of source and destination modulo 64 KiB lies in 0xFEC0..0xFFF0) and fences them.
void copyRow(const uint8_t* src, uint8_t* dst, std::size_t length, bool streaming);

// Copies a region of one-byte samples. zoxStatusNullPointer, zoxStatusBadSize below 1, else Ok. Streams
// when the region is at least 1 MiB and at least half of the largest cache (or overflows 32 bits).
zoxStatus copyPlane(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roi);

// Fills one row of `length` bytes with the pattern's bytes (sixteen equal ones).
void fillRow(const uint8_t (&pattern)[16], uint8_t* dst, std::size_t length, bool streaming);

// Sets a region of one-byte samples to `value`, with the checks of copyPlane. Streams when the region
// has more than 1 MiB samples and at least as many as the core services' cache size.
zoxStatus fillPlane(uint8_t value, uint8_t* dst, int dstStep, int width, int height);

// The cache size the plane copy compares with, in bytes, or 0 when none is known: from the processor's
// cache descriptors where the vendor's table applies (read once, by probeCacheDescriptors while the
// library loads), else from the core services, asked at the call.
int64_t planeCopyCacheSize();
void probeCacheDescriptors();

} // namespace zox
