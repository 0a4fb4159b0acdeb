// robotcfg serve: the setup dialogs as a local page, over the JSON API.
#include <pthread.h>

#include <csignal>
#include <cstdio>
#include <mutex>
#include <random>
#include <thread>

#include <httplib.h>

#include "cli/Commands.h"
#include "cli/ServeApi.h"
#include "cli/ServeGuard.h"
#include "cli/ServePage.h"

namespace {

/// Headers of every answer: nothing of the page may come from elsewhere or be framed or cached.
constexpr const char *kSecurityHeaders[][2] = {
    {"Content-Security-Policy", "default-src 'self'; img-src 'self' data:; frame-ancestors 'none'"},
    {"X-Content-Type-Options", "nosniff"},
    {"Cache-Control", "no-store"},
    {"Referrer-Policy", "no-referrer"},
};

/// 24 random bytes as hex: the secret the URL carries.
std::string randomToken() {
  std::random_device device;
  static constexpr char kDigits[] = "0123456789abcdef";
  std::string sToken;
  for (int n = 0; n < 24; ++n) {
    const unsigned nByte = device() & 0xFFu;
    sToken += kDigits[nByte >> 4];
    sToken += kDigits[nByte & 15];
  }
  return sToken;
}

/// The token a request presents: "Authorization: token X", else ?token=X.
std::string presentedToken(const httplib::Request &request) {
  const std::string sAuthorization = request.get_header_value("Authorization");
  if (sAuthorization.rfind("token ", 0) == 0) return sAuthorization.substr(6);
  return request.get_param_value("token");
}

}  // namespace

int runServe(const TOptions &options) {
  std::string sError;
  const std::vector<std::string> programs = servedPrograms(options.files, sError);
  if (!sError.empty()) {
    std::fprintf(stderr, "robotcfg: %s\n", sError.c_str());
    return kExitUsage;
  }
  const bool bLoopback = options.sServeHost.empty() || options.sServeHost == "127.0.0.1";
  const std::string sBindHost = bLoopback ? "127.0.0.1" : options.sServeHost;
  if (!bLoopback)
    std::fprintf(stderr, "robotcfg: warning: listening on %s: anyone who can reach it and has the token can change "
                         "the programs\n", sBindHost.c_str());

  // Ctrl-C and SIGTERM are taken by a thread of their own, which stops the server cleanly.
  sigset_t stopSignals;
  sigemptyset(&stopSignals);
  sigaddset(&stopSignals, SIGINT);
  sigaddset(&stopSignals, SIGTERM);
  // A shell may start a background job with SIGINT ignored; the server still stops on it.
  std::signal(SIGINT, SIG_DFL);
  std::signal(SIGTERM, SIG_DFL);
  pthread_sigmask(SIG_BLOCK, &stopSignals, nullptr);

  httplib::Server server;
  CServeApi api(programs);
  std::mutex apiMutex;  // the record and the host selection are not shared between threads
  TServeFacts facts;
  facts.sToken = randomToken();
  facts.sExtraHost = bLoopback ? std::string() : sBindHost;

  server.set_payload_max_length(kMaxServeBodyBytes);
  server.set_pre_routing_handler([&facts](const httplib::Request &request, httplib::Response &response) {
    for (const auto &header : kSecurityHeaders) response.set_header(header[0], header[1]);
    const int nStatus = guardServeRequest(
        facts, {request.method, request.path, request.get_header_value("Host"), request.get_header_value("Origin"),
                presentedToken(request)});
    if (nStatus == 0) return httplib::Server::HandlerResponse::Unhandled;
    response.status = nStatus;
    response.set_content("{\"error\":\"refused\"}", "application/json");
    return httplib::Server::HandlerResponse::Handled;
  });
  server.Get("/", [](const httplib::Request &, httplib::Response &response) {
    response.set_content(servePageHtml(), "text/html; charset=utf-8");
  });
  server.Get("/app.js", [](const httplib::Request &, httplib::Response &response) {
    response.set_content(servePageScript(), "text/javascript; charset=utf-8");
  });
  server.Get("/app.css", [](const httplib::Request &, httplib::Response &response) {
    response.set_content(servePageCss(), "text/css; charset=utf-8");
  });
  auto apiHandler = [&api, &apiMutex](const httplib::Request &request, httplib::Response &response) {
    std::lock_guard<std::mutex> lock(apiMutex);
    const TServeResponse answer = api.handle(request.method, request.path, request.body);
    response.status = answer.nStatus;
    response.set_content(answer.sBody, answer.sContentType.c_str());
  };
  server.Get(R"(/api/.*)", apiHandler);
  server.Post(R"(/api/.*)", apiHandler);

  facts.nPort = options.nServePort > 0 ? (server.bind_to_port(sBindHost.c_str(), options.nServePort) ? options.nServePort : -1)
                                       : server.bind_to_any_port(sBindHost.c_str());
  if (facts.nPort <= 0) {
    std::fprintf(stderr, "robotcfg: cannot listen on %s:%d\n", sBindHost.c_str(), options.nServePort);
    return kExitUsage;
  }
  std::printf("robotcfg: serving %zu program%s at http://%s:%d/?token=%s\n", programs.size(),
              programs.size() == 1 ? "" : "s", bLoopback ? "127.0.0.1" : sBindHost.c_str(), facts.nPort,
              facts.sToken.c_str());
  std::printf("robotcfg: press Ctrl-C to stop\n");
  std::fflush(stdout);

  std::thread stopper([&server, stopSignals]() {
    int nSignal = 0;
    sigwait(&stopSignals, &nSignal);
    server.stop();
  });
  server.listen_after_bind();
  // The server may end by itself; wake the waiting thread so that it ends too.
  pthread_kill(stopper.native_handle(), SIGTERM);
  stopper.join();
  return kExitOk;
}
