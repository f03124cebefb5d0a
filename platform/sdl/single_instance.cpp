#include "platform/sdl/single_instance.h"

#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

#include <cerrno>
#include <cstddef>
#include <cstring>

namespace sdl {

namespace {

constexpr char kRaiseRequest[] = "raise";
// A copy that connects and never writes must not pile up descriptors here.
constexpr std::size_t kMaxPending = 8;

socklen_t MakeAddress(const std::string& name, sockaddr_un& address) {
    std::memset(&address, 0, sizeof address);
    address.sun_family = AF_UNIX;
    std::memcpy(address.sun_path, name.data(), name.size());
    // Abstract names are counted bytes, not NUL-terminated strings.
    return static_cast<socklen_t>(offsetof(sockaddr_un, sun_path) + name.size());
}

void CloseFd(int& fd) {
    if (fd >= 0) {
        ::close(fd);
        fd = -1;
    }
}

}  // namespace

SingleInstance::~SingleInstance() {
    StopListening();
    CloseFd(link_);
}

std::string SingleInstance::AddressName(const std::string& title) const {
    std::string name = std::string(1, '\0') + "redizor-" + std::to_string(::getuid()) + "-";
    if (!scope_.empty()) {
        name += scope_ + "-";
    }
    name += title;
    constexpr std::size_t kMax = sizeof(sockaddr_un{}.sun_path);
    if (name.size() > kMax) {
        name.resize(kMax);
    }
    return name;
}

bool SingleInstance::Listen(const std::string& title) {
    StopListening();
    int fd = ::socket(AF_UNIX, SOCK_STREAM | SOCK_NONBLOCK | SOCK_CLOEXEC, 0);
    if (fd < 0) {
        return false;
    }
    sockaddr_un address;
    socklen_t length = MakeAddress(AddressName(title), address);
    if (::bind(fd, reinterpret_cast<sockaddr*>(&address), length) != 0 || ::listen(fd, 4) != 0) {
        ::close(fd);
        return false;
    }
    listener_ = fd;
    return true;
}

void SingleInstance::StopListening() {
    CloseFd(listener_);
    for (int& fd : pending_) {
        CloseFd(fd);
    }
    pending_.clear();
}

bool SingleInstance::RaiseRequested() {
    if (listener_ < 0) {
        return false;
    }
    for (;;) {
        int fd = ::accept4(listener_, nullptr, nullptr, SOCK_NONBLOCK | SOCK_CLOEXEC);
        if (fd < 0) {
            break;
        }
        if (pending_.size() == kMaxPending) {
            CloseFd(pending_.front());
            pending_.erase(pending_.begin());
        }
        pending_.push_back(fd);
    }
    bool raise = false;
    for (auto it = pending_.begin(); it != pending_.end();) {
        char buffer[16];
        ssize_t n = ::recv(*it, buffer, sizeof buffer, 0);
        if (n < 0 && (errno == EAGAIN || errno == EWOULDBLOCK || errno == EINTR)) {
            ++it;  // connected but not written yet: look again on the next pass
            continue;
        }
        if (n >= static_cast<ssize_t>(sizeof kRaiseRequest - 1) &&
            std::memcmp(buffer, kRaiseRequest, sizeof kRaiseRequest - 1) == 0) {
            raise = true;
        }
        ::close(*it);
        it = pending_.erase(it);
    }
    return raise;
}

bool SingleInstance::ConnectToRunningCopy(const std::string& title) {
    CloseFd(link_);
    int fd = ::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0);
    if (fd < 0) {
        return false;
    }
    sockaddr_un address;
    socklen_t length = MakeAddress(AddressName(title), address);
    if (::connect(fd, reinterpret_cast<sockaddr*>(&address), length) != 0) {
        ::close(fd);
        return false;
    }
    link_ = fd;
    return true;
}

void SingleInstance::AskRunningCopyToRaise() {
    if (link_ < 0) {
        return;
    }
    // MSG_NOSIGNAL: a copy that has just ended must not take this one down with SIGPIPE.
    (void)::send(link_, kRaiseRequest, sizeof kRaiseRequest - 1, MSG_NOSIGNAL);
    CloseFd(link_);
}

}  // namespace sdl
