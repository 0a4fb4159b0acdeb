// Running robotcfg from tests: a child process with its standard streams
// connected to pipes, arguments passed as they are (no shell), and a line
// diff for readable failure messages.
#pragma once

#include <fcntl.h>
#include <poll.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <optional>
#include <sstream>
#include <string>
#include <vector>

extern char **environ;

namespace testing_support {

struct TRunResult {
  int nExit = -1;  ///< exit status, or 128 + signal number when killed by a signal
  std::string sOut;
  std::string sErr;
};

/// Runs `args[0]` with `args` as its argument vector. The child's standard
/// input gets `stdinData` (or /dev/null when there is none); `sWorkDir`, when
/// given, becomes its working directory; `sStdoutFile`, when given, receives
/// its standard output instead of `sOut`. ROBOTCFG_PLATFORM is removed from the
/// child's environment so that the defaults are those of the command line.
inline TRunResult runProcess(const std::vector<std::string> &args, const std::optional<std::string> &stdinData = {},
                             const std::string &sWorkDir = {}, const std::string &sStdoutFile = {}) {
  TRunResult result;
  if (args.empty()) return result;
  // A child that exits without reading its input must not kill the test.
  std::signal(SIGPIPE, SIG_IGN);

  std::vector<char *> argv;
  for (const std::string &sArg : args) argv.push_back(const_cast<char *>(sArg.c_str()));
  argv.push_back(nullptr);
  std::vector<char *> envp;
  for (char **pp = environ; *pp; ++pp)
    if (std::strncmp(*pp, "ROBOTCFG_PLATFORM=", 18) != 0) envp.push_back(*pp);
  envp.push_back(nullptr);

  int inPipe[2] = {-1, -1}, outPipe[2], errPipe[2];
  if (::pipe2(outPipe, O_CLOEXEC) != 0 || ::pipe2(errPipe, O_CLOEXEC) != 0) return result;
  if (stdinData && ::pipe2(inPipe, O_CLOEXEC) != 0) return result;

  const pid_t pid = ::fork();
  if (pid < 0) return result;
  if (pid == 0) {
    // Only async-signal-safe calls from here to exec.
    int nIn = inPipe[0];
    if (!stdinData) nIn = ::open("/dev/null", O_RDONLY);
    const int nOut = sStdoutFile.empty() ? outPipe[1] : ::open(sStdoutFile.c_str(), O_WRONLY);
    if (nIn < 0 || nOut < 0 || ::dup2(nIn, 0) < 0 || ::dup2(nOut, 1) < 0 || ::dup2(errPipe[1], 2) < 0) ::_exit(126);
    if (!sWorkDir.empty() && ::chdir(sWorkDir.c_str()) != 0) ::_exit(126);
    ::execve(argv[0], argv.data(), envp.data());
    ::_exit(127);
  }

  ::close(outPipe[1]);
  ::close(errPipe[1]);
  size_t nWritten = 0;
  int nInFd = -1;
  if (stdinData) {
    ::close(inPipe[0]);
    nInFd = inPipe[1];
    ::fcntl(nInFd, F_SETFL, O_NONBLOCK);
    if (stdinData->empty()) {
      ::close(nInFd);
      nInFd = -1;
    }
  }
  int nOutFd = outPipe[0], nErrFd = errPipe[0];
  char buffer[65536];
  while (nOutFd >= 0 || nErrFd >= 0 || nInFd >= 0) {
    pollfd fds[3];
    nfds_t n = 0;
    if (nOutFd >= 0) fds[n++] = {nOutFd, POLLIN, 0};
    if (nErrFd >= 0) fds[n++] = {nErrFd, POLLIN, 0};
    if (nInFd >= 0) fds[n++] = {nInFd, POLLOUT, 0};
    if (::poll(fds, n, -1) < 0) {
      if (errno == EINTR) continue;
      break;
    }
    for (nfds_t i = 0; i < n; ++i) {
      if (fds[i].revents == 0) continue;
      if (fds[i].fd == nInFd) {
        const ssize_t nDone = ::write(nInFd, stdinData->data() + nWritten, stdinData->size() - nWritten);
        if (nDone > 0) nWritten += size_t(nDone);
        if ((nDone < 0 && errno != EAGAIN && errno != EINTR) || nWritten == stdinData->size()) {
          ::close(nInFd);
          nInFd = -1;
        }
        continue;
      }
      const ssize_t nRead = ::read(fds[i].fd, buffer, sizeof buffer);
      if (nRead < 0 && (errno == EINTR || errno == EAGAIN)) continue;
      std::string &sTarget = fds[i].fd == nOutFd ? result.sOut : result.sErr;
      if (nRead > 0) {
        sTarget.append(buffer, size_t(nRead));
        continue;
      }
      ::close(fds[i].fd);
      (fds[i].fd == nOutFd ? nOutFd : nErrFd) = -1;
    }
  }
  if (nInFd >= 0) ::close(nInFd);
  if (nOutFd >= 0) ::close(nOutFd);
  if (nErrFd >= 0) ::close(nErrFd);

  int nStatus = 0;
  while (::waitpid(pid, &nStatus, 0) < 0 && errno == EINTR) {
  }
  if (WIFEXITED(nStatus)) result.nExit = WEXITSTATUS(nStatus);
  else if (WIFSIGNALED(nStatus)) result.nExit = 128 + WTERMSIG(nStatus);
  return result;
}

/// Runs the built robotcfg with `args` (the program name is added).
inline TRunResult runRobotcfg(std::vector<std::string> args, const std::optional<std::string> &stdinData = {},
                              const std::string &sWorkDir = {}, const std::string &sStdoutFile = {}) {
  args.insert(args.begin(), ROBOTCFG_EXE);
  return runProcess(args, stdinData, sWorkDir, sStdoutFile);
}

/// One line made visible: carriage returns and other control or non-ASCII
/// bytes are escaped, so that a difference in them shows.
inline std::string visibleLine(const std::string &sLine) {
  std::string sOut;
  for (unsigned char c : sLine) {
    if (c == '\r') sOut += "\\r";
    else if (c == '\t') sOut += "\\t";
    else if (c < 0x20 || c >= 0x7F) {
      char sHex[8];
      std::snprintf(sHex, sizeof sHex, "\\x%02X", c);
      sOut += sHex;
    } else sOut += char(c);
  }
  return sOut;
}

/// Both texts line by line ("-" expected, "+" actual) from the first line
/// that differs, empty when they are equal.
inline std::string lineDiff(const std::string &sExpected, const std::string &sActual) {
  if (sExpected == sActual) return {};
  size_t nSame = 0;
  for (size_t i = 0; i < std::min(sExpected.size(), sActual.size()) && sExpected[i] == sActual[i]; ++i)
    if (sExpected[i] == '\n') nSame = i + 1;
  std::string sOut = "--- expected\n+++ actual (from the first differing line)\n";
  for (const auto &[cPrefix, sText] : {std::pair<char, std::string>{'-', sExpected.substr(nSame)}, {'+', sActual.substr(nSame)}})
    for (size_t nStart = 0; nStart < sText.size();) {
      const size_t nEnd = std::min(sText.find('\n', nStart), sText.size());
      sOut += cPrefix + visibleLine(sText.substr(nStart, nEnd - nStart)) + "\n";
      nStart = nEnd + 1;
    }
  return sOut;
}

/// A directory under the system's temporary directory, removed with its
/// files when the object ends.
class CTempDir {
 public:
  CTempDir() {
    const char *pzBase = std::getenv("TMPDIR");
    std::string sTemplate = std::string(pzBase && *pzBase ? pzBase : "/tmp") + "/robotcfg-test-XXXXXX";
    std::vector<char> name(sTemplate.begin(), sTemplate.end());
    name.push_back('\0');
    if (::mkdtemp(name.data())) m_sPath = name.data();
  }
  ~CTempDir() {
    std::error_code error;
    if (!m_sPath.empty()) std::filesystem::remove_all(m_sPath, error);
  }
  CTempDir(const CTempDir &) = delete;
  CTempDir &operator=(const CTempDir &) = delete;

  const std::string &path() const { return m_sPath; }
  std::string file(const std::string &sName) const { return m_sPath + "/" + sName; }

 private:
  std::string m_sPath;
};

/// A whole file's bytes; empty when it cannot be read.
inline std::string readFile(const std::string &sPath) {
  std::ifstream in(sPath, std::ios::binary);
  std::ostringstream bytes;
  bytes << in.rdbuf();
  return bytes.str();
}

/// The words of a text split at white space, as a shell splits an options line.
inline std::vector<std::string> splitWords(const std::string &sText) {
  std::istringstream in(sText);
  std::vector<std::string> words;
  for (std::string sWord; in >> sWord;) words.push_back(sWord);
  return words;
}

}  // namespace testing_support
