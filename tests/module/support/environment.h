// A worse environment, for as long as an object of it lives.
#pragma once

#include <sys/mount.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

#include <csignal>
#include <string>

namespace ambrix_test {

/// No file can grow beyond so many bytes: writing more fails as on a full disk.
class FileSizeLimit {
 public:
  explicit FileSizeLimit(rlim_t bytes) : handler_(std::signal(SIGXFSZ, SIG_IGN)) {
    getrlimit(RLIMIT_FSIZE, &before_);
    const rlimit limit = {bytes, before_.rlim_max};
    setrlimit(RLIMIT_FSIZE, &limit);
  }
  ~FileSizeLimit() {
    setrlimit(RLIMIT_FSIZE, &before_);
    (void)std::signal(SIGXFSZ, handler_);
  }
  FileSizeLimit(const FileSizeLimit&) = delete;
  FileSizeLimit& operator=(const FileSizeLimit&) = delete;

 private:
  rlimit before_ = {};
  void (*handler_)(int);
};

/// The current folder can be read and not written, by a user whom permissions bind.
class ReadOnlyFolder {
 public:
  ReadOnlyFolder() : user_(geteuid()) {
    chmod(".", 0555);
    constexpr uid_t kNobody = 65534;
    if (user_ == 0) bound_ = seteuid(kNobody) == 0;
  }
  ~ReadOnlyFolder() {
    if (user_ == 0 && bound_) bound_ = seteuid(user_) == 0;
    chmod(".", 0755);
  }
  ReadOnlyFolder(const ReadOnlyFolder&) = delete;
  ReadOnlyFolder& operator=(const ReadOnlyFolder&) = delete;

  /// Whether permissions bind.
  [[nodiscard]] bool holds() const { return bound_; }

 private:
  uid_t user_;
  bool bound_ = true;
};

/// A file system of so many bytes in the folder, if this process may mount one.
class SmallFileSystem {
 public:
  SmallFileSystem(std::string folder, long bytes) : folder_(std::move(folder)) {
    mkdir(folder_.c_str(), 0755);
    const std::string size = "size=" + std::to_string(bytes);
    mounted_ = mount("tmpfs", folder_.c_str(), "tmpfs", 0, size.c_str()) == 0;
  }
  ~SmallFileSystem() {
    if (mounted_) umount2(folder_.c_str(), MNT_DETACH);
  }
  SmallFileSystem(const SmallFileSystem&) = delete;
  SmallFileSystem& operator=(const SmallFileSystem&) = delete;

  [[nodiscard]] bool mounted() const { return mounted_; }

 private:
  std::string folder_;
  bool mounted_ = false;
};

}  // namespace ambrix_test
