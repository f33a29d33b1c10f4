// The stand-in's handle-based file functions, _access and the injected faults.
#include <gtest/gtest.h>

#include <cerrno>
#include <string>

#include "platform/FileFaults.h"
#include "platform/Win32.h"
#include "tests/support/TempFolder.h"

namespace {

HANDLE Open(const std::string& path, DWORD dwAccess, DWORD dwDisposition) {
    return CreateFileA(path.c_str(), dwAccess, 0, nullptr, dwDisposition, FILE_ATTRIBUTE_NORMAL,
                       nullptr);
}

TEST(CreateFile, WritesReadsAndReplaces) {
    CTempFolder folder;
    HANDLE hFile = Open(folder.Path("new.txt"), GENERIC_WRITE, CREATE_ALWAYS);
    ASSERT_NE(hFile, INVALID_HANDLE_VALUE);
    DWORD n = 0xDEADBEEF;
    EXPECT_TRUE(WriteFile(hFile, "abc\r\n", 5, &n, nullptr));
    EXPECT_EQ(n, 5u);
    EXPECT_TRUE(FlushFileBuffers(hFile));
    EXPECT_TRUE(CloseHandle(hFile));
    EXPECT_FALSE(CloseHandle(hFile));
    EXPECT_EQ(GetLastError(), ERROR_INVALID_HANDLE);

    hFile = Open(folder.Path("new.txt"), GENERIC_READ, OPEN_EXISTING);
    char buffer[16];
    EXPECT_TRUE(ReadFile(hFile, buffer, sizeof buffer, &n, nullptr));
    EXPECT_EQ(std::string(buffer, n), "abc\r\n");
    EXPECT_TRUE(ReadFile(hFile, buffer, sizeof buffer, &n, nullptr));
    EXPECT_EQ(n, 0u);  // end of file
    CloseHandle(hFile);

    folder.Write("old.txt", "old");
    EXPECT_FALSE(MoveFileExA(folder.Path("new.txt").c_str(), folder.Path("old.txt").c_str(), 0));
    EXPECT_EQ(GetLastError(), ERROR_ALREADY_EXISTS);
    EXPECT_TRUE(MoveFileExA(folder.Path("new.txt").c_str(), folder.Path("old.txt").c_str(),
                            MOVEFILE_REPLACE_EXISTING));
    EXPECT_EQ(folder.Read("old.txt"), "abc\r\n");
    EXPECT_TRUE(DeleteFileA(folder.Path("old.txt").c_str()));
    EXPECT_FALSE(DeleteFileA(folder.Path("old.txt").c_str()));
    EXPECT_EQ(GetLastError(), ERROR_FILE_NOT_FOUND);
}

TEST(CreateFile, InjectedFaultsFailTheChosenOperationsBelowTheirPath) {
    CTempFolder folder;
    folder.Write("keep.txt", "keep");
    StandInSetFileFault(folder.Path().c_str(), STANDIN_FAULT_WRITE, ERROR_DISK_FULL);
    HANDLE hFile = Open(folder.Path("full.txt"), GENERIC_WRITE, CREATE_ALWAYS);
    ASSERT_NE(hFile, INVALID_HANDLE_VALUE);
    DWORD n = 0;
    EXPECT_FALSE(WriteFile(hFile, "x", 1, &n, nullptr));
    EXPECT_EQ(GetLastError(), ERROR_DISK_FULL);
    CloseHandle(hFile);

    StandInSetFileFault(folder.Path("keep").c_str(), STANDIN_FAULT_DELETE, ERROR_ACCESS_DENIED);
    EXPECT_FALSE(DeleteFileA(folder.Path("keep.txt").c_str()));
    EXPECT_TRUE(DeleteFileA(folder.Path("full.txt").c_str()));  // outside the fault's path
    StandInSetFileFault(nullptr, 0, 0);
    EXPECT_EQ(folder.Read("keep.txt"), "keep");
}

TEST(Access, ChecksExistenceAndModes) {
    CTempFolder folder;
    folder.Write("a.txt", "a");
    EXPECT_EQ(_access(folder.Path("a.txt").c_str(), 0), 0);
    EXPECT_EQ(_access(folder.Path("a.txt").c_str(), 6), 0);
    EXPECT_EQ(_access((folder.Path() + "\\a.txt").c_str(), 4), 0);
    errno = 0;
    EXPECT_EQ(_access(folder.Path("b.txt").c_str(), 0), -1);
    EXPECT_EQ(errno, ENOENT);
    EXPECT_EQ(_access(folder.Path("a.txt").c_str(), 1), -1);
    EXPECT_EQ(errno, EINVAL);
}

}  // namespace
