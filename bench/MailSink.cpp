#include "bench/MailSink.h"

#include <arpa/inet.h>
#include <cctype>
#include <netinet/in.h>
#include <stdexcept>
#include <string>
#include <string_view>
#include <sys/socket.h>
#include <unistd.h>

namespace pelmar::bench {

namespace {

void sendText(int connection, std::string_view text)
{
    while (!text.empty()) {
        const ssize_t sent = ::send(connection, text.data(), text.size(), MSG_NOSIGNAL);
        if (sent <= 0)
            return;
        text.remove_prefix(static_cast<size_t>(sent));
    }
}

// The answer to a command line; empty for QUIT, which ends the session.
std::string_view answerTo(std::string_view line, bool& data)
{
    const auto is = [&](std::string_view verb) {
        if (line.size() < verb.size())
            return false;
        for (size_t i = 0; i < verb.size(); ++i) {
            if (std::toupper(static_cast<unsigned char>(line[i])) != verb[i])
                return false;
        }
        return true;
    };
    if (is("EHLO"))
        return "250-sink\r\n250 8BITMIME\r\n";
    if (is("DATA")) {
        data = true;
        return "354 go on\r\n";
    }
    if (is("QUIT"))
        return {};
    return "250 OK\r\n";
}

}  // namespace

MailSink::MailSink()
{
    listener_ = ::socket(AF_INET, SOCK_STREAM, 0);
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    socklen_t length = sizeof address;
    if (::bind(listener_, reinterpret_cast<sockaddr*>(&address), length) != 0 || ::listen(listener_, 16) != 0
        || ::getsockname(listener_, reinterpret_cast<sockaddr*>(&address), &length) != 0)
        throw std::runtime_error("the mail sink cannot listen");
    port_ = ntohs(address.sin_port);
    acceptor_ = std::thread([this] { acceptConnections(); });
}

MailSink::~MailSink()
{
    ::shutdown(listener_, SHUT_RDWR);
    ::close(listener_);
    acceptor_.join();
    for (std::thread& connection : connections_)
        connection.join();
}

void MailSink::acceptConnections()
{
    for (;;) {
        const int connection = ::accept(listener_, nullptr, nullptr);
        if (connection < 0)
            return;
        connections_.emplace_back([this, connection] { serve(connection); });
    }
}

void MailSink::serve(int connection)
{
    sendText(connection, "220 sink\r\n");
    std::string pending;
    bool data = false;
    char buffer[65536];
    for (ssize_t got; (got = ::recv(connection, buffer, sizeof buffer, 0)) > 0;) {
        pending.append(buffer, static_cast<size_t>(got));
        std::string answers;
        size_t start = 0;
        for (size_t end; (end = pending.find("\r\n", start)) != std::string::npos; start = end + 2) {
            const std::string_view line(pending.data() + start, end - start);
            if (data) {
                if (line == ".") {
                    data = false;
                    ++accepted_;
                    answers += "250 queued\r\n";
                }
                continue;
            }
            const std::string_view answer = answerTo(line, data);
            if (answer.empty()) {
                sendText(connection, answers + "221 bye\r\n");
                ::close(connection);
                return;
            }
            answers += answer;
        }
        pending.erase(0, start);
        sendText(connection, answers);
    }
    ::close(connection);
}

}  // namespace pelmar::bench
