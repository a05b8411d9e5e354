#pragma once

#include <atomic>
#include <thread>
#include <vector>

namespace pelmar::bench {

// An SMTP server on 127.0.0.1 that accepts every message and throws it away, fast enough not to
// be what a measurement measures: plain sockets, a thread a connection, answers without delay.
class MailSink {
public:
    MailSink();
    ~MailSink();
    MailSink(const MailSink&) = delete;
    MailSink& operator=(const MailSink&) = delete;

    int port() const { return port_; }
    // The messages accepted so far (a 250 after their data).
    long accepted() const { return accepted_; }

private:
    void acceptConnections();
    void serve(int connection);

    int listener_ = -1;
    int port_ = 0;
    std::atomic<long> accepted_{0};
    std::thread acceptor_;
    std::vector<std::thread> connections_;
};

}  // namespace pelmar::bench
