#include "robotconfig/program/FileIO.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <vector>

namespace {

std::string errorText(const std::string &sWhat, const std::string &sPath) {
  return "cannot " + sWhat + " '" + sPath + "': " + std::strerror(errno);
}

// Reads everything from an open descriptor.
bool readAll(int fd, std::string &sBytes) {
  char buffer[1 << 14];  // not cleared: only what read() fills is used
  for (;;) {
    const ssize_t n = ::read(fd, buffer, sizeof buffer);
    if (n == 0) return true;
    if (n < 0) {
      if (errno == EINTR) continue;
      return false;
    }
    sBytes.append(buffer, size_t(n));
  }
}

// Writes everything to an open descriptor.
bool writeAll(int fd, const std::string &sBytes) {
  size_t nDone = 0;
  while (nDone < sBytes.size()) {
    const ssize_t n = ::write(fd, sBytes.data() + nDone, sBytes.size() - nDone);
    if (n < 0) {
      if (errno == EINTR) continue;
      return false;
    }
    nDone += size_t(n);
  }
  return true;
}

}  // namespace

bool readProgramFile(const std::string &sPath, std::string &sBytes, std::string &sError) {
  sBytes.clear();
  if (sPath == "-") {
    if (readAll(STDIN_FILENO, sBytes)) return true;
    sError = errorText("read", "<stdin>");
    return false;
  }
  const int fd = ::open(sPath.c_str(), O_RDONLY | O_CLOEXEC);
  if (fd < 0) {
    sError = errorText("open", sPath);
    return false;
  }
  struct stat info {};
  if (::fstat(fd, &info) == 0 && S_ISDIR(info.st_mode)) {
    ::close(fd);
    errno = EISDIR;
    sError = errorText("read", sPath);
    return false;
  }
  const bool bOk = readAll(fd, sBytes);
  if (!bOk) sError = errorText("read", sPath);
  ::close(fd);
  return bOk;
}

bool writeFileAtomically(const std::string &sPath, const std::string &sBytes, std::string &sError) {
  // A symbolic link stays a link: the file it points to is the one replaced.
  char *pzResolved = ::realpath(sPath.c_str(), nullptr);
  if (!pzResolved) {
    sError = errorText("rewrite", sPath);
    return false;
  }
  const std::string sTarget = pzResolved;
  std::free(pzResolved);
  struct stat info {};
  if (::stat(sTarget.c_str(), &info) != 0) {
    sError = errorText("rewrite", sPath);
    return false;
  }
  std::string sTemp = sTarget + ".robotcfg-XXXXXX";
  std::vector<char> templ(sTemp.begin(), sTemp.end());
  templ.push_back('\0');
  const int fd = ::mkstemp(templ.data());
  if (fd < 0) {
    sError = errorText("create a temporary file beside", sPath) + "; the file is unchanged";
    return false;
  }
  sTemp = templ.data();
  bool bOk = writeAll(fd, sBytes) && ::fchmod(fd, info.st_mode & 07777) == 0 && ::fsync(fd) == 0;
  if (!bOk) sError = errorText("rewrite", sPath) + "; the file is unchanged";
  if (::close(fd) != 0 && bOk) {
    bOk = false;
    sError = errorText("rewrite", sPath) + "; the file is unchanged";
  }
  if (bOk && ::rename(sTemp.c_str(), sTarget.c_str()) != 0) {
    bOk = false;
    sError = errorText("replace", sPath) + "; the file is unchanged";
  }
  if (!bOk) ::unlink(sTemp.c_str());
  return bOk;
}
