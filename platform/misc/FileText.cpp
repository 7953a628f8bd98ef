#include "platform/misc/FileText.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <filesystem>
#include <system_error>

namespace {

String describe(const char* what, const String& path, int err) {
  return String(what) + " " + path + ": " + std::strerror(err);
}

// Closes the descriptor on every path out of a function.
class FdGuard {
 public:
  explicit FdGuard(int fd) : fd_(fd) {}
  ~FdGuard() {
    if (fd_ >= 0) ::close(fd_);
  }
  FdGuard(const FdGuard&) = delete;
  FdGuard& operator=(const FdGuard&) = delete;
  int get() const { return fd_; }
  // Closes now and reports the result: a delayed write error can surface here.
  int close() {
    const int rc = ::close(fd_);
    fd_ = -1;
    return rc;
  }

 private:
  int fd_;
};

bool writeAll(int fd, std::string_view bytes) {
  while (!bytes.empty()) {
    const ssize_t n = ::write(fd, bytes.data(), bytes.size());
    if (n < 0) {
      if (errno == EINTR) continue;
      return false;
    }
    bytes.remove_prefix(static_cast<std::size_t>(n));
  }
  return true;
}

// Makes the rename itself durable. Failure here does not undo a completed rename, so it is
// not reported.
void syncDirectory(const std::filesystem::path& dir) {
  const int fd = ::open(dir.empty() ? "." : dir.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
  if (fd < 0) return;
  ::fsync(fd);
  ::close(fd);
}

}  // namespace

FileText::ReadResult FileText::read(const String& path, String& out, String& error) {
  out.clear();
  FdGuard fd(::open(path.c_str(), O_RDONLY | O_CLOEXEC));
  if (fd.get() < 0) {
    // ENOTDIR: a folder on the way is a plain file, so the file cannot exist either.
    if (errno == ENOENT || errno == ENOTDIR) return ReadResult::Missing;
    error = describe("cannot open", path, errno);
    return ReadResult::Failed;
  }
  struct stat st {};
  if (::fstat(fd.get(), &st) != 0) {
    error = describe("cannot stat", path, errno);
    return ReadResult::Failed;
  }
  if (S_ISDIR(st.st_mode)) {
    error = describe("cannot read", path, EISDIR);
    return ReadResult::Failed;
  }
  char buf[16384];
  for (;;) {
    const ssize_t n = ::read(fd.get(), buf, sizeof buf);
    if (n < 0) {
      if (errno == EINTR) continue;
      error = describe("cannot read", path, errno);
      out.clear();
      return ReadResult::Failed;
    }
    if (n == 0) break;
    if (out.size() + static_cast<std::size_t>(n) > kMaxReadBytes) {
      error =
          "refusing to read " + path + ": larger than " + std::to_string(kMaxReadBytes) + " bytes";
      out.clear();
      return ReadResult::Failed;
    }
    out.append(buf, static_cast<std::size_t>(n));
  }
  return ReadResult::Ok;
}

bool FileText::writeAtomically(const String& path, std::string_view bytes, String& error) {
  if (path.empty()) {
    error = "no file name given";
    return false;
  }
  const std::filesystem::path target(path);
  const std::filesystem::path dir = target.parent_path();
  if (!dir.empty()) {
    std::error_code ec;
    std::filesystem::create_directories(dir, ec);
    if (ec) {
      error = "cannot create directory " + dir.string() + ": " + ec.message();
      return false;
    }
  }

  String tmpName = path + ".tmp-XXXXXX";
  FdGuard fd(::mkostemp(tmpName.data(), O_CLOEXEC));
  if (fd.get() < 0) {
    error = describe("cannot create temporary file for", path, errno);
    return false;
  }
  const auto fail = [&](const char* what) {
    error = describe(what, tmpName, errno);
    ::unlink(tmpName.c_str());
    return false;
  };
  // The temporary file is private (0600); a file being replaced keeps its own permissions.
  struct stat old {};
  if (::stat(path.c_str(), &old) == 0 && S_ISREG(old.st_mode) &&
      ::fchmod(fd.get(), old.st_mode & 07777) != 0) {
    return fail("cannot set permissions of");
  }
  if (!writeAll(fd.get(), bytes)) return fail("cannot write");
  if (::fsync(fd.get()) != 0) return fail("cannot flush");
  if (fd.close() != 0) return fail("cannot close");
  if (::rename(tmpName.c_str(), path.c_str()) != 0) {
    const int err = errno;
    ::unlink(tmpName.c_str());
    error = describe("cannot replace", path, err);
    return false;
  }
  syncDirectory(dir);
  return true;
}
