#include "cli/ServeGuard.h"

namespace {

/// Host names that reach the loopback interface.
constexpr const char *kLoopbackHosts[] = {"127.0.0.1", "localhost", "[::1]"};

/// True when `sHost` is "NAME:PORT" for one of the allowed names and the server's port.
bool bIsServerHost(const TServeFacts &server, const std::string &sHost) {
  const std::string sPort = ":" + std::to_string(server.nPort);
  for (const char *pzName : kLoopbackHosts)
    if (sHost == pzName + sPort) return true;
  return !server.sExtraHost.empty() && sHost == server.sExtraHost + sPort;
}

}  // namespace

bool bSameSecret(const std::string &sA, const std::string &sB) {
  unsigned char nDiffer = sA.size() == sB.size() ? 0 : 1;
  const std::string &sShorter = sA.size() < sB.size() ? sA : sB;
  for (size_t n = 0; n < sShorter.size(); ++n) nDiffer |= static_cast<unsigned char>(sA[n] ^ sB[n]);
  return nDiffer == 0;
}

int guardServeRequest(const TServeFacts &server, const TServeRequestFacts &request) {
  if (!bIsServerHost(server, request.sHost)) return 403;
  if (!request.sOrigin.empty()) {
    const std::string sOriginHost = request.sOrigin.rfind("http://", 0) == 0 ? request.sOrigin.substr(7) : std::string();
    if (!bIsServerHost(server, sOriginHost)) return 403;
  }
  if (request.sPath.rfind("/api/", 0) == 0 && (request.sToken.empty() || !bSameSecret(request.sToken, server.sToken)))
    return 403;
  return 0;
}
