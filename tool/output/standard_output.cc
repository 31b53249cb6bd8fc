#include "tool/output/standard_output.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <system_error>
#include <utility>

#include "tool/supervision/steps.h"

namespace ambrix::tool {
namespace {

constexpr std::size_t kBufferBytes = 1 << 16;

/// A descriptor below 3 that is closed would become that of the next file opened.
void occupyStandardDescriptors() {
  int descriptor = 0;
  while (descriptor >= 0 && descriptor <= STDERR_FILENO)
    descriptor = ::open("/dev/null", O_RDWR);
  if (descriptor >= 0) ::close(descriptor);
}

}  // namespace

StandardOutput::StandardOutput() {
  std::signal(SIGPIPE, SIG_IGN);
  occupyStandardDescriptors();
  descriptor_ = ::fcntl(STDOUT_FILENO, F_DUPFD_CLOEXEC, STDERR_FILENO + 1);
  if (descriptor_ < 0 || ::dup2(STDERR_FILENO, STDOUT_FILENO) < 0) {
    throw std::system_error(errno, std::generic_category(), "standard output");
  }
}

void StandardOutput::write(std::string_view text) {
  if (buffer_.size() + text.size() > kBufferBytes) flush();
  if (text.size() > kBufferBytes) return writeNow(text);
  buffer_ += text;
}

void StandardOutput::flush() {
  const std::string text = std::exchange(buffer_, {});
  writeNow(text);
}

void StandardOutput::redirect(const std::string& path, const std::string& name) {
  const int file = ::open(path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0666);
  if (file < 0) throw std::system_error(errno, std::generic_category(), name);
  ::close(std::exchange(descriptor_, file));
  name_ = name;
}

void StandardOutput::writeNow(std::string_view text) {
  const Pause pause;  // a reader may take its time
  while (!text.empty()) {
    const ssize_t written = ::write(descriptor_, text.data(), text.size());
    if (written >= 0) {
      text.remove_prefix(static_cast<std::size_t>(written));
    } else if (errno == EPIPE) {
      throw OutputClosed();
    } else if (errno != EINTR) {
      throw std::system_error(errno, std::generic_category(), name_);
    }
  }
}

bool StandardOutput::isTerminal() const noexcept {
  return ::isatty(descriptor_) == 1;
}

bool errorIsTerminal() noexcept {
  return ::isatty(STDERR_FILENO) == 1;
}

}  // namespace ambrix::tool
