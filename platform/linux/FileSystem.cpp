#include "platform/linux/FileSystem.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>

#include "platform/linux/Kernel32.h"

namespace standin {

namespace {

struct CFault {
    std::string prefix;
    DWORD operations = 0;
    DWORD error = ERROR_SUCCESS;
};

CFault& Fault() {
    static CFault fault;
    return fault;
}

bool FolderExists(const std::string& path) {
    const size_t slash = path.find_last_of('/');
    if (slash == std::string::npos) {
        return true;
    }
    struct stat info {};
    return stat(slash == 0 ? "/" : path.substr(0, slash).c_str(), &info) == 0 &&
           S_ISDIR(info.st_mode);
}

}  // namespace

std::string ToHostPath(const char* pszPath) {
    std::string path(pszPath ? pszPath : "");
    for (char& ch : path) {
        if (ch == '\\') {
            ch = '/';
        }
    }
    return path;
}

bool HasFolder(std::string_view path) {
    return path.find_first_of("/\\") != std::string::npos;
}

DWORD ErrorFromErrno(int nErrno, const std::string& path) {
    switch (nErrno) {
        case 0:
            return ERROR_SUCCESS;
        case ENOENT:
            return FolderExists(path) ? ERROR_FILE_NOT_FOUND : ERROR_PATH_NOT_FOUND;
        case ENOTDIR:
            return ERROR_PATH_NOT_FOUND;
        case EACCES:
        case EPERM:
        case EROFS:
        case EISDIR:
        case ETXTBSY:
            return ERROR_ACCESS_DENIED;
        case EEXIST:
            return ERROR_FILE_EXISTS;
        case ENOSPC:
        case EDQUOT:
            return ERROR_DISK_FULL;
        case ENAMETOOLONG:
            return ERROR_FILENAME_EXCED_RANGE;
        case ENOMEM:
            return ERROR_NOT_ENOUGH_MEMORY;
        case EBADF:
            return ERROR_INVALID_HANDLE;
        default:
            return ERROR_GEN_FAILURE;
    }
}

DWORD InjectedFault(DWORD dwOperation, const std::string& path) {
    const CFault& fault = Fault();
    const bool hit = (fault.operations & dwOperation) && !fault.prefix.empty() &&
                     path.compare(0, fault.prefix.size(), fault.prefix) == 0;
    return hit ? fault.error : ERROR_SUCCESS;
}

DWORD ReadWholeFile(const std::string& path, std::string& bytes) {
    bytes.clear();
    if (const DWORD error = InjectedFault(STANDIN_FAULT_OPEN_READ, path)) {
        return error;
    }
    const int fd = open(path.c_str(), O_RDONLY | O_CLOEXEC);
    if (fd < 0) {
        return ErrorFromErrno(errno, path);
    }
    DWORD error = InjectedFault(STANDIN_FAULT_READ, path);
    char buffer[65536];
    while (error == ERROR_SUCCESS) {
        const ssize_t n = read(fd, buffer, sizeof buffer);
        if (n > 0) {
            bytes.append(buffer, size_t(n));
        } else if (n == 0) {
            break;
        } else if (errno != EINTR) {
            error = ErrorFromErrno(errno, path);
        }
    }
    close(fd);
    return error;
}

DWORD WriteWholeFile(const std::string& path, std::string_view bytes) {
    if (const DWORD error = InjectedFault(STANDIN_FAULT_CREATE, path)) {
        return error;
    }
    const int fd = open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0666);
    if (fd < 0) {
        return ErrorFromErrno(errno, path);
    }
    DWORD error = InjectedFault(STANDIN_FAULT_WRITE, path);
    while (error == ERROR_SUCCESS && !bytes.empty()) {
        const ssize_t n = write(fd, bytes.data(), bytes.size());
        if (n >= 0) {
            bytes.remove_prefix(size_t(n));
        } else if (errno != EINTR) {
            error = ErrorFromErrno(errno, path);
        }
    }
    if (close(fd) != 0 && error == ERROR_SUCCESS) {
        error = ErrorFromErrno(errno, path);
    }
    return error;
}

}  // namespace standin

extern "C" void StandInSetFileFault(LPCSTR pszPathPrefix, DWORD dwOperations, DWORD dwError) {
    standin::Fault() = {standin::ToHostPath(pszPathPrefix), pszPathPrefix ? dwOperations : 0,
                        dwError};
}
