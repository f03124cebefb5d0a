// Finds another running copy of the program by its window title and asks it to come to the
// front. The running copy answers on a Linux abstract-namespace socket named for the user and
// the title: the kernel drops the name with the process, so a crash leaves nothing behind.
#pragma once

#include <string>
#include <vector>

namespace sdl {

class SingleInstance {
public:
    SingleInstance() = default;
    SingleInstance(const SingleInstance&) = delete;
    SingleInstance& operator=(const SingleInstance&) = delete;
    ~SingleInstance();

    // Copies with different scopes do not see each other (see sdl::Config::instanceScope).
    void SetScope(const std::string& scope) { scope_ = scope; }
    // The socket address for a title, leading NUL included, cut to what an address can hold.
    std::string AddressName(const std::string& title) const;

    // The running copy's side. Listen is false when the name is taken (or sockets fail).
    bool Listen(const std::string& title);
    void StopListening();
    // Never blocks: takes new connections and reads what they sent. True when one of them has
    // asked for the window to come to the front since the last call.
    bool RaiseRequested();

    // The starting copy's side. True when a copy listens under this title.
    bool ConnectToRunningCopy(const std::string& title);
    // Sends the request over the connection made by ConnectToRunningCopy, then closes it.
    void AskRunningCopyToRaise();

private:
    std::string scope_;
    int listener_ = -1;
    std::vector<int> pending_;  // accepted connections that have not said anything yet
    int link_ = -1;             // our connection to the running copy
};

}  // namespace sdl
