// What callers of zlib pass to it: the binary interface that all its versions share. The CDF
// library carries a copy of zlib under names of its own, and no header for it.
#pragma once

namespace ambrix::inflate {

struct ZStream {
  const unsigned char* next_in;
  unsigned int avail_in;
  unsigned long total_in;
  unsigned char* next_out;
  unsigned int avail_out;
  unsigned long total_out;
  const char* msg;
  void* state;
  void* (*zalloc)(void*, unsigned int, unsigned int);
  void (*zfree)(void*, void*);
  void* opaque;
  int data_type;
  unsigned long adler;
  unsigned long reserved;
};

inline constexpr int kNoFlush = 0;
inline constexpr int kSyncFlush = 2;

inline constexpr int kOk = 0;
inline constexpr int kStreamEnd = 1;
inline constexpr int kStreamError = -2;
inline constexpr int kDataError = -3;
inline constexpr int kBufferError = -5;

/// What `windowBits` is for a gzip stream with the largest window.
inline constexpr int kGzip = 15 + 16;

}  // namespace ambrix::inflate
