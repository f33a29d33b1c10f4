// The stand-in's handle-based file functions, last error and _access, over POSIX descriptors.
#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <set>
#include <string>

#include "platform/Win32.h"
#include "platform/linux/FileSystem.h"

namespace {

thread_local DWORD t_dwLastError = ERROR_SUCCESS;

// An open file; its address is the HANDLE.
struct CFileHandle {
    int fd;
    std::string path;
};

// Handles the stand-in gave out, so that a stray or closed handle is refused, not dereferenced.
std::set<CFileHandle*>& OpenHandles() {
    static std::set<CFileHandle*> handles;
    return handles;
}

CFileHandle* FindHandle(HANDLE hFile) {
    auto* pFile = static_cast<CFileHandle*>(hFile);
    return OpenHandles().count(pFile) ? pFile : nullptr;
}

BOOL Fail(DWORD dwError) {
    t_dwLastError = dwError;
    return FALSE;
}

int OpenFlags(DWORD dwAccess, DWORD dwDisposition) {
    int flags = O_CLOEXEC;
    if ((dwAccess & GENERIC_READ) && (dwAccess & GENERIC_WRITE)) {
        flags |= O_RDWR;
    } else {
        flags |= (dwAccess & GENERIC_WRITE) ? O_WRONLY : O_RDONLY;
    }
    switch (dwDisposition) {
        case CREATE_NEW:
            return flags | O_CREAT | O_EXCL;
        case CREATE_ALWAYS:
            return flags | O_CREAT | O_TRUNC;
        case OPEN_ALWAYS:
            return flags | O_CREAT;
        case TRUNCATE_EXISTING:
            return flags | O_TRUNC;
        case OPEN_EXISTING:
            return flags;
        default:
            return -1;
    }
}

}  // namespace

extern "C" {

DWORD GetLastError() {
    return t_dwLastError;
}

void SetLastError(DWORD dwErrCode) {
    t_dwLastError = dwErrCode;
}

HANDLE CreateFileA(LPCSTR lpFileName, DWORD dwDesiredAccess, DWORD, LPSECURITY_ATTRIBUTES,
                   DWORD dwCreationDisposition, DWORD, HANDLE) {
    const int flags = OpenFlags(dwDesiredAccess, dwCreationDisposition);
    if (!lpFileName || flags < 0) {
        Fail(ERROR_INVALID_PARAMETER);
        return INVALID_HANDLE_VALUE;
    }
    const std::string path = standin::ToHostPath(lpFileName);
    if (!standin::HasFolder(path)) {
        Fail(path.empty() ? ERROR_PATH_NOT_FOUND : ERROR_FILE_NOT_FOUND);
        return INVALID_HANDLE_VALUE;
    }
    const bool writing = (dwDesiredAccess & GENERIC_WRITE) || (flags & (O_CREAT | O_TRUNC));
    const DWORD dwFault =
        standin::InjectedFault(writing ? STANDIN_FAULT_CREATE : STANDIN_FAULT_OPEN_READ, path);
    if (dwFault != ERROR_SUCCESS) {
        Fail(dwFault);
        return INVALID_HANDLE_VALUE;
    }
    const int fd = open(path.c_str(), flags, 0666);
    if (fd < 0) {
        Fail(standin::ErrorFromErrno(errno, path));
        return INVALID_HANDLE_VALUE;
    }
    auto* pFile = new CFileHandle{fd, path};
    OpenHandles().insert(pFile);
    t_dwLastError = ERROR_SUCCESS;
    return pFile;
}

BOOL ReadFile(HANDLE hFile, LPVOID lpBuffer, DWORD nNumberOfBytesToRead,
              LPDWORD lpNumberOfBytesRead, LPOVERLAPPED) {
    if (lpNumberOfBytesRead) {
        *lpNumberOfBytesRead = 0;
    }
    const CFileHandle* pFile = FindHandle(hFile);
    if (!pFile || (!lpBuffer && nNumberOfBytesToRead)) {
        return Fail(pFile ? ERROR_INVALID_PARAMETER : ERROR_INVALID_HANDLE);
    }
    if (const DWORD dwFault = standin::InjectedFault(STANDIN_FAULT_READ, pFile->path)) {
        return Fail(dwFault);
    }
    ssize_t n;
    do {
        n = read(pFile->fd, lpBuffer, nNumberOfBytesToRead);
    } while (n < 0 && errno == EINTR);
    if (n < 0) {
        return Fail(standin::ErrorFromErrno(errno, pFile->path));
    }
    if (lpNumberOfBytesRead) {
        *lpNumberOfBytesRead = DWORD(n);
    }
    return TRUE;
}

BOOL WriteFile(HANDLE hFile, LPCVOID lpBuffer, DWORD nNumberOfBytesToWrite,
               LPDWORD lpNumberOfBytesWritten, LPOVERLAPPED) {
    if (lpNumberOfBytesWritten) {
        *lpNumberOfBytesWritten = 0;
    }
    const CFileHandle* pFile = FindHandle(hFile);
    if (!pFile || (!lpBuffer && nNumberOfBytesToWrite)) {
        return Fail(pFile ? ERROR_INVALID_PARAMETER : ERROR_INVALID_HANDLE);
    }
    if (const DWORD dwFault = standin::InjectedFault(STANDIN_FAULT_WRITE, pFile->path)) {
        return Fail(dwFault);
    }
    // Windows writes a file's bytes completely or fails; a short write here means a full disk.
    const auto* p = static_cast<const char*>(lpBuffer);
    DWORD dwDone = 0;
    while (dwDone < nNumberOfBytesToWrite) {
        const ssize_t n = write(pFile->fd, p + dwDone, nNumberOfBytesToWrite - dwDone);
        if (n < 0 && errno == EINTR) {
            continue;
        }
        if (n <= 0) {
            return Fail(n < 0 ? standin::ErrorFromErrno(errno, pFile->path) : ERROR_DISK_FULL);
        }
        dwDone += DWORD(n);
        if (lpNumberOfBytesWritten) {
            *lpNumberOfBytesWritten = dwDone;
        }
    }
    return TRUE;
}

BOOL FlushFileBuffers(HANDLE hFile) {
    const CFileHandle* pFile = FindHandle(hFile);
    if (!pFile) {
        return Fail(ERROR_INVALID_HANDLE);
    }
    if (const DWORD dwFault = standin::InjectedFault(STANDIN_FAULT_WRITE, pFile->path)) {
        return Fail(dwFault);
    }
    return fsync(pFile->fd) == 0 ? TRUE : Fail(standin::ErrorFromErrno(errno, pFile->path));
}

BOOL CloseHandle(HANDLE hObject) {
    CFileHandle* pFile = FindHandle(hObject);
    if (!pFile) {
        return Fail(ERROR_INVALID_HANDLE);
    }
    OpenHandles().erase(pFile);
    const int result = close(pFile->fd);
    const int nErrno = errno;
    const std::string path = pFile->path;
    delete pFile;
    return result == 0 ? TRUE : Fail(standin::ErrorFromErrno(nErrno, path));
}

BOOL MoveFileExA(LPCSTR lpExistingFileName, LPCSTR lpNewFileName, DWORD dwFlags) {
    if (!lpExistingFileName || !lpNewFileName) {
        return Fail(ERROR_INVALID_PARAMETER);
    }
    const std::string from = standin::ToHostPath(lpExistingFileName);
    const std::string to = standin::ToHostPath(lpNewFileName);
    for (const std::string* path : {&from, &to}) {
        if (const DWORD dwFault = standin::InjectedFault(STANDIN_FAULT_MOVE, *path)) {
            return Fail(dwFault);
        }
    }
    if (!(dwFlags & MOVEFILE_REPLACE_EXISTING) && access(to.c_str(), F_OK) == 0) {
        return Fail(ERROR_ALREADY_EXISTS);
    }
    // rename() replaces the target in one step, as MoveFileEx does on one volume.
    return rename(from.c_str(), to.c_str()) == 0 ? TRUE
                                                 : Fail(standin::ErrorFromErrno(errno, from));
}

BOOL DeleteFileA(LPCSTR lpFileName) {
    if (!lpFileName) {
        return Fail(ERROR_INVALID_PARAMETER);
    }
    const std::string path = standin::ToHostPath(lpFileName);
    if (const DWORD dwFault = standin::InjectedFault(STANDIN_FAULT_DELETE, path)) {
        return Fail(dwFault);
    }
    return unlink(path.c_str()) == 0 ? TRUE : Fail(standin::ErrorFromErrno(errno, path));
}

int _access(const char* path, int mode) {
    if (!path || (mode & ~6) != 0) {
        errno = EINVAL;
        return -1;
    }
    const std::string hostPath = standin::ToHostPath(path);
    if (standin::InjectedFault(STANDIN_FAULT_OPEN_READ, hostPath) != ERROR_SUCCESS) {
        errno = EACCES;
        return -1;
    }
    return access(hostPath.c_str(), mode == 0 ? F_OK : mode);
}

}  // extern "C"
