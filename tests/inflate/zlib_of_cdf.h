// The zlib in the CDF library, by its own names.
#pragma once

#include "inflate/zlib_abi.h"

extern "C" {
int z_inflateInit2_(ambrix::inflate::ZStream*, int, const char*, int);
int z_inflate(ambrix::inflate::ZStream*, int);
int z_inflateEnd(ambrix::inflate::ZStream*);
int z_deflateInit2_(ambrix::inflate::ZStream*, int, int, int, int, int, const char*, int);
int z_deflate(ambrix::inflate::ZStream*, int);
int z_deflateEnd(ambrix::inflate::ZStream*);
}
