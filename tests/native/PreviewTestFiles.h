// Drawings and pictures built in memory for the preview tests and benchmarks: the container as
// the CAD application lays it out, device-independent bitmaps, and PNG files (stored deflate
// blocks, so no compression library is needed).
#pragma once

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <functional>
#include <string>
#include <utility>
#include <vector>

namespace previewtest {

using Bytes = std::vector<uint8_t>;
using Entry = std::pair<uint8_t, Bytes>;  // code, bytes

inline void put16(Bytes &b, uint32_t v) {
  b.push_back(uint8_t(v));
  b.push_back(uint8_t(v >> 8));
}
inline void put32(Bytes &b, uint32_t v) {
  put16(b, v & 0xFFFF);
  put16(b, v >> 16);
}
inline void set32(Bytes &b, size_t at, uint32_t v) {
  for (int i = 0; i < 4; ++i) b[at + i] = uint8_t(v >> (8 * i));
}
inline void putBe32(Bytes &b, uint32_t v) {
  for (int i = 3; i >= 0; --i) b.push_back(uint8_t(v >> (8 * i)));
}

constexpr uint8_t kSentinel[16] = {0x1F, 0x25, 0x6D, 0x07, 0xD4, 0x36, 0x28, 0x28,
                                   0x9D, 0x57, 0xCA, 0x3F, 0x9D, 0x44, 0x10, 0x2B};
constexpr uint8_t kEndSentinel[16] = {0xE0, 0xDA, 0x92, 0xF8, 0x2B, 0xC9, 0xD7, 0xD7,
                                      0x62, 0xA8, 0x35, 0xC0, 0x62, 0xBB, 0xEF, 0xD4};
constexpr size_t kDirectoryAddress = 0x1C0;

// A drawing whose preview directory at kDirectoryAddress holds the entries in order.
inline Bytes buildDrawing(const std::vector<Entry> &entries, size_t padding = 256) {
  Bytes file(kDirectoryAddress, 0);
  std::memcpy(file.data(), "AC1032", 6);
  set32(file, 0x0D, uint32_t(kDirectoryAddress));
  file.insert(file.end(), kSentinel, kSentinel + 16);
  uint32_t overall = 1 + 9 * uint32_t(entries.size());
  for (const Entry &entry : entries) overall += uint32_t(entry.second.size());
  put32(file, overall);
  file.push_back(uint8_t(entries.size()));
  uint32_t start = uint32_t(file.size() + 9 * entries.size());
  for (const Entry &entry : entries) {
    file.push_back(entry.first);
    put32(file, start);
    put32(file, uint32_t(entry.second.size()));
    start += uint32_t(entry.second.size());
  }
  for (const Entry &entry : entries) file.insert(file.end(), entry.second.begin(), entry.second.end());
  file.insert(file.end(), kEndSentinel, kEndSentinel + 16);
  file.resize(file.size() + padding, 0);
  return file;
}

inline Entry headerData() { return {1, Bytes(80, 0)}; }

struct DibSpec {
  int32_t width = 1;
  int32_t height = 1;
  uint16_t bitCount = 24;
  uint32_t compression = 0;
  uint32_t colorsUsed = 0;
  uint32_t headerSize = 40;
  uint16_t planes = 1;
  std::vector<uint32_t> palette;  // 0x00RRGGBB, written as RGBQUAD
  std::vector<uint32_t> masks;    // after a 40-byte header, or inside a longer one
};

inline size_t dibStride(const DibSpec &spec) { return (size_t(spec.width < 0 ? 0 : spec.width) * spec.bitCount + 31) / 32 * 4; }

// Header, masks, palette, then the rows exactly as given (in file order).
inline Bytes buildDib(const DibSpec &spec, const Bytes &rows) {
  Bytes b;
  put32(b, spec.headerSize);
  put32(b, uint32_t(spec.width));
  put32(b, uint32_t(spec.height));
  put16(b, spec.planes);
  put16(b, spec.bitCount);
  put32(b, spec.compression);
  put32(b, uint32_t(rows.size()));
  put32(b, 2835);
  put32(b, 2835);
  put32(b, spec.colorsUsed);
  put32(b, 0);
  for (uint32_t mask : spec.masks) put32(b, mask);
  if (b.size() < spec.headerSize && spec.headerSize <= 124) b.resize(spec.headerSize, 0);
  for (uint32_t colour : spec.palette) put32(b, colour & 0xFFFFFF);
  b.insert(b.end(), rows.begin(), rows.end());
  return b;
}

// A 24-bit bottom-up bitmap of colour(x, y) (0x00RRGGBB, y = 0 at the top).
inline Bytes buildDib24(int32_t width, int32_t height, const std::function<uint32_t(int, int)> &colour) {
  DibSpec spec;
  spec.width = width;
  spec.height = height;
  const size_t stride = dibStride(spec);
  Bytes rows(stride * size_t(height), 0);
  for (int y = 0; y < height; ++y)
    for (int x = 0; x < width; ++x) {
      const uint32_t c = colour(x, y);
      uint8_t *p = rows.data() + stride * size_t(height - 1 - y) + 3 * size_t(x);
      p[0] = uint8_t(c), p[1] = uint8_t(c >> 8), p[2] = uint8_t(c >> 16);
    }
  return buildDib(spec, rows);
}

inline uint32_t crc32(const uint8_t *data, size_t size, uint32_t crc = 0) {
  crc = ~crc;
  for (size_t i = 0; i < size; ++i) {
    crc ^= data[i];
    for (int k = 0; k < 8; ++k) crc = (crc >> 1) ^ (0xEDB88320u & (0u - (crc & 1)));
  }
  return ~crc;
}

inline void putPngChunk(Bytes &png, const char *type, const Bytes &data) {
  putBe32(png, uint32_t(data.size()));
  const size_t typeAt = png.size();
  png.insert(png.end(), type, type + 4);
  png.insert(png.end(), data.begin(), data.end());
  putBe32(png, crc32(png.data() + typeAt, png.size() - typeAt));
}

// An 8-bit PNG of colour(x, y): RGB from 0x00RRGGBB, or with alpha RGBA from 0xAARRGGBB.
inline Bytes buildPng(uint32_t width, uint32_t height, const std::function<uint32_t(int, int)> &colour, bool alpha = false) {
  Bytes raw;
  for (uint32_t y = 0; y < height; ++y) {
    raw.push_back(0);  // filter: none
    for (uint32_t x = 0; x < width; ++x) {
      const uint32_t c = colour(int(x), int(y));
      raw.push_back(uint8_t(c >> 16)), raw.push_back(uint8_t(c >> 8)), raw.push_back(uint8_t(c));
      if (alpha) raw.push_back(uint8_t(c >> 24));
    }
  }
  Bytes z = {0x78, 0x01};
  uint32_t a = 1, b = 0;
  for (uint8_t byte : raw) a = (a + byte) % 65521, b = (b + a) % 65521;
  for (size_t at = 0; at < raw.size() || at == 0; at += 65535) {
    const size_t n = std::min<size_t>(65535, raw.size() - at);
    z.push_back(at + n == raw.size() ? 1 : 0);
    put16(z, uint32_t(n));
    put16(z, uint32_t(~n & 0xFFFF));
    z.insert(z.end(), raw.begin() + long(at), raw.begin() + long(at + n));
  }
  putBe32(z, b << 16 | a);

  Bytes png = {0x89, 'P', 'N', 'G', '\r', '\n', 0x1A, '\n'};
  Bytes header;
  putBe32(header, width);
  putBe32(header, height);
  header.insert(header.end(), {8, uint8_t(alpha ? 6 : 2), 0, 0, 0});
  putPngChunk(png, "IHDR", header);
  putPngChunk(png, "IDAT", z);
  putPngChunk(png, "IEND", {});
  return png;
}

// A line drawing of width x height: white frame and diagonals on dark grey, so that every part
// of the picture differs from a pure-colour background.
inline uint32_t lineArt(int x, int y, int width, int height) {
  const bool frame = x < 2 || y < 2 || x >= width - 2 || y >= height - 2;
  const bool diagonal =
      std::abs(x * height - y * width) < 2 * width || std::abs((width - 1 - x) * height - y * width) < 2 * width;
  return frame || diagonal ? 0xFFFFFF : 0x202830;
}

}  // namespace previewtest
