#include "settings/AtomicReplace.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {
class FileDescriptor {
 public:
  explicit FileDescriptor(int fd) : m_fd(fd) {}
  ~FileDescriptor() {
    if (m_fd >= 0) ::close(m_fd);
  }
  FileDescriptor(const FileDescriptor &) = delete;
  FileDescriptor &operator=(const FileDescriptor &) = delete;
  int Get() const { return m_fd; }

 private:
  int m_fd;
};

std::string ParentFolder(const std::string &path) {
  const std::string::size_type slash = path.find_last_of('/');
  if (slash == std::string::npos) return ".";
  return slash == 0 ? std::string("/") : path.substr(0, slash);
}
}  // namespace

bool CommitFileToDisk(std::FILE *file) { return ::fsync(::fileno(file)) == 0; }

bool ReplaceFileAtomically(const std::string &source, const std::string &target) {
  // The new file keeps the old one's permissions; a failure here costs only those.
  struct stat old;
  if (::stat(target.c_str(), &old) == 0 && S_ISREG(old.st_mode)) ::chmod(source.c_str(), old.st_mode & 07777);

  if (std::rename(source.c_str(), target.c_str()) != 0) return false;

  // The rename itself lives in the folder; without this a power loss may undo it.
  // The replacement has already happened, so a failure here is not reported.
  const FileDescriptor folder(::open(ParentFolder(target).c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
  if (folder.Get() >= 0) ::fsync(folder.Get());
  return true;
}
