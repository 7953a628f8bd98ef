#pragma once
// Whole-file text input and atomic output for the small files the core services keep
// (preferences, configuration records, string tables).
#include <cstddef>
#include <string_view>

#include "platform/kw/String.h"

class FileText {
 public:
  enum class ReadResult { Ok, Missing, Failed };

  // Files larger than this are refused rather than read: none of our files come near it, and a
  // runaway file must not exhaust memory.
  static constexpr std::size_t kMaxReadBytes = 64u << 20;

  // Reads the whole file into `out`. Missing: the file does not exist (out is emptied).
  // Failed: it exists but cannot be read, or is too large; `error` says why.
  static ReadResult read(const String& path, String& out, String& error);

  // Replaces the file with `bytes` so that a reader sees either the old or the new contents,
  // never a mixture: a temporary file in the same directory is written, flushed to disk and
  // renamed over the target. Missing parent directories are created. On failure the previous
  // file is left untouched, the temporary file is removed, `error` says why and false is
  // returned.
  static bool writeAtomically(const String& path, std::string_view bytes, String& error);
};
