#include "buttons/ImageSearchPath.h"

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <system_error>

namespace fs = std::filesystem;

ImageSearchPath::ImageSearchPath() {
  const char* env = std::getenv("GLOBKIT_IMAGE_PATH");
  if (!env) return;
  const String list(env);
  size_t start = 0;
  while (start <= list.size()) {
    const size_t end = std::min(list.find(':', start), list.size());
    addDirectory(list.substr(start, end - start));
    start = end + 1;
  }
}

void ImageSearchPath::addDirectory(const String& dir) {
  if (dir.empty() || std::find(dirs_.begin(), dirs_.end(), dir) != dirs_.end()) return;
  dirs_.push_back(dir);
}

String ImageSearchPath::resolve(const String& name) const {
  if (name.empty()) return String();
  const fs::path p(name);
  if (p.is_absolute()) return name;
  for (const String& dir : dirs_) {
    const fs::path candidate = fs::path(dir) / p;
    std::error_code ec;  // unreadable directories are simply not matches
    if (fs::is_regular_file(candidate, ec)) return candidate.string();
  }
  return name;
}

String ImageSearchPath::resolve(const WString& name) const {
  return resolve(Kw::toUtf8(name));
}

ImageSearchPath& imageSearchPath() {
  static ImageSearchPath path;
  return path;
}
