#include "Platform/Posix/PosixFiles.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include "Platform/Posix/FileDescriptor.h"

namespace kelvasi {

bool PosixFiles::exists(const std::string& path) const {
  return ::access(path.c_str(), F_OK) == 0;
}

bool PosixFiles::write(const std::string& path, std::span<const std::uint8_t> bytes) {
  constexpr mode_t permissions = 0666;  // less the umask
  FileDescriptor file(::open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, permissions));
  if (!file) return false;
  struct stat status {};
  const bool isFile = ::fstat(file.number(), &status) == 0 && S_ISREG(status.st_mode);
  const bool isWritten = writeAll(file.number(), bytes);
  if (file.close() && isWritten) return true;
  if (isFile) ::unlink(path.c_str());
  return false;
}

}  // namespace kelvasi
