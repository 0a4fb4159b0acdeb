// Who may talk to `robotcfg serve`: a pure decision from the request's Host,
// Origin and token and the server's own facts, so that it can be tested as a table.
#pragma once

#include <string>

struct TServeFacts {
  std::string sToken;         ///< the secret printed with the URL
  int nPort = 0;              ///< the port the server listens on
  std::string sExtraHost;     ///< the --host name, when the server listens elsewhere
};

struct TServeRequestFacts {
  std::string sMethod;
  std::string sPath;
  std::string sHost;     ///< the Host header
  std::string sOrigin;   ///< the Origin header, "" when absent
  std::string sToken;    ///< from "Authorization: token X" or ?token=X, "" when absent
};

/// 0 when the request may proceed, else the status to refuse it with (403).
/// Order: the Host must name this server (DNS rebinding); an Origin, when
/// sent, must be this server's; the API needs the token. The page itself
/// holds no data and needs no token.
int guardServeRequest(const TServeFacts &server, const TServeRequestFacts &request);

/// Compares two texts in time that depends on their lengths only.
bool bSameSecret(const std::string &sA, const std::string &sB);
