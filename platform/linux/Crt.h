// The parts of the Windows C runtime that glibc lacks, with the runtime's names and signatures.
#pragma once

extern "C" {
// 0 when the file or folder exists and allows the access asked for (0 exists, 2 write, 4 read,
// 6 both); otherwise -1 with errno set (ENOENT, EACCES, EINVAL for another mode).
int _access(const char* path, int mode);
}
