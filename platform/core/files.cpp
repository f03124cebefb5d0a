// Files of the device folder, through POSIX descriptors.
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include "platform/core/device.h"
#include "platform/core/record.h"
#include "platform/core/utf.h"
#include "platform/files.h"

namespace {

struct FileHandle {
    int fd;
};

FileHandle* AsFile(HANDLE h) {
    if (h == nullptr || h == INVALID_HANDLE_VALUE) {
        return nullptr;
    }
    return static_cast<FileHandle*>(h);
}

}  // namespace

HANDLE CreateFileW(LPCWSTR path, DWORD access, DWORD shareMode, LPVOID security, DWORD creation,
                   DWORD flags, HANDLE templateFile) {
    (void)shareMode;
    (void)security;
    (void)flags;
    (void)templateFile;
    platform::Record& record = platform::CallRecord();
    std::string devicePath = platform::ToUtf8(path);
    std::string hostPath = platform::ResolveDevicePath(devicePath);
    int fd = -1;
    if (creation == OPEN_EXISTING && !hostPath.empty()) {
        bool write = (access & GENERIC_WRITE) != 0;
        bool read = (access & GENERIC_READ) != 0;
        int mode = write ? (read ? O_RDWR : O_WRONLY) : O_RDONLY;
        fd = ::open(hostPath.c_str(), mode | O_CLOEXEC);
        struct stat st {};
        if (fd >= 0 && (::fstat(fd, &st) != 0 || !S_ISREG(st.st_mode))) {
            ::close(fd);
            fd = -1;
        }
    }
    if (record.enabled) {
        (fd >= 0 ? record.filesOpened : record.filesRefused).push_back(devicePath);
    }
    if (fd < 0) {
        return INVALID_HANDLE_VALUE;
    }
    return new FileHandle{fd};
}

BOOL ReadFile(HANDLE file, LPVOID buffer, DWORD toRead, DWORD* read, LPVOID overlapped) {
    (void)overlapped;
    if (read != nullptr) {
        *read = 0;
    }
    FileHandle* f = AsFile(file);
    if (f == nullptr) {
        return FALSE;
    }
    long long failAt = platform::InjectedReadFailure();
    if (failAt >= 0 && toRead > 0 && ::lseek(f->fd, 0, SEEK_CUR) + toRead > failAt) {
        return FALSE;
    }
    DWORD total = 0;
    auto* out = static_cast<char*>(buffer);
    while (total < toRead) {
        ssize_t n = ::read(f->fd, out + total, toRead - total);
        if (n < 0) {
            return FALSE;
        }
        if (n == 0) {
            break;
        }
        total += static_cast<DWORD>(n);
    }
    if (read != nullptr) {
        *read = total;
    }
    return TRUE;
}

DWORD SetFilePointer(HANDLE file, LONG distance, LONG* distanceHigh, DWORD method) {
    FileHandle* f = AsFile(file);
    if (f == nullptr) {
        return INVALID_SET_FILE_POINTER;
    }
    off_t offset = distance;
    if (distanceHigh != nullptr) {
        offset = static_cast<off_t>(
            (static_cast<std::uint64_t>(static_cast<DWORD>(*distanceHigh)) << 32) |
            static_cast<DWORD>(distance));
    }
    int whence = method == FILE_CURRENT ? SEEK_CUR : method == FILE_END ? SEEK_END : SEEK_SET;
    off_t pos = ::lseek(f->fd, offset, whence);
    if (pos < 0) {
        return INVALID_SET_FILE_POINTER;
    }
    if (distanceHigh != nullptr) {
        *distanceHigh = static_cast<LONG>(static_cast<std::uint64_t>(pos) >> 32);
    }
    return static_cast<DWORD>(pos);
}

DWORD GetFileSize(HANDLE file, DWORD* sizeHigh) {
    FileHandle* f = AsFile(file);
    struct stat st {};
    if (f == nullptr || ::fstat(f->fd, &st) != 0) {
        return 0xFFFFFFFFu;
    }
    auto size = static_cast<std::uint64_t>(st.st_size);
    if (sizeHigh != nullptr) {
        *sizeHigh = static_cast<DWORD>(size >> 32);
    }
    return static_cast<DWORD>(size);
}

BOOL CloseHandle(HANDLE object) {
    FileHandle* f = AsFile(object);
    if (f == nullptr) {
        return FALSE;
    }
    ::close(f->fd);
    delete f;
    return TRUE;
}
