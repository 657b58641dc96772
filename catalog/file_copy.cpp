#include "catalog/file_copy.h"

#include <cerrno>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

class Fd
{
public:
    explicit Fd(int fd) : m_fd(fd) {}
    ~Fd()
    {
        if (m_fd >= 0)
            ::close(m_fd);
    }
    Fd(const Fd&) = delete;
    Fd& operator=(const Fd&) = delete;
    int get() const { return m_fd; }
    int release()
    {
        const int fd = m_fd;
        m_fd = -1;
        return fd;
    }

private:
    int m_fd;
};

int WriteAll(int fd, const char* p, size_t size)
{
    while (size > 0) {
        const ssize_t w = ::write(fd, p, size);
        if (w < 0 && errno == EINTR)
            continue;
        if (w <= 0)
            return w < 0 ? errno : ENOSPC;
        p += w;
        size -= static_cast<size_t>(w);
    }
    return 0;
}

int CopyRest(int in, int out)
{
    bool useRange = true;
    char buffer[1 << 16];
    for (;;) {
        ssize_t n;
        if (useRange) {
            n = ::copy_file_range(in, nullptr, out, nullptr, 1 << 30, 0);
            if (n < 0 &&
                (errno == EXDEV || errno == ENOSYS || errno == EINVAL || errno == EOPNOTSUPP)) {
                useRange = false;
                continue;
            }
        } else {
            n = ::read(in, buffer, sizeof buffer);
            if (n > 0) {
                if (const int error = WriteAll(out, buffer, static_cast<size_t>(n)))
                    return error;
            }
        }
        if (n < 0 && errno == EINTR)
            continue;
        if (n < 0)
            return errno;
        if (n == 0)
            return 0;
    }
}

} // namespace

int CopyFileTo(const std::string& source, const std::string& target, const CCopyOptions& options)
{
    Fd in(::open(source.c_str(), O_RDONLY | O_CLOEXEC));
    if (in.get() < 0)
        return errno;
    struct stat st;
    if (::fstat(in.get(), &st) != 0)
        return errno;
    if (!S_ISREG(st.st_mode))
        return EISDIR;
    const int flags = O_WRONLY | O_CREAT | O_CLOEXEC | (options.overwrite ? O_TRUNC : O_EXCL);
    Fd out(::open(target.c_str(), flags, st.st_mode & 0666));
    if (out.get() < 0)
        return errno;
    int error = 0;
    if (options.head) {
        // Read without moving the offset: the copy itself stays in the kernel.
        options.head->resize(options.headBytes);
        size_t got = 0;
        while (got < options.headBytes) {
            const ssize_t n = ::pread(in.get(), options.head->data() + got,
                                      options.headBytes - got, static_cast<off_t>(got));
            if (n < 0 && errno == EINTR)
                continue;
            if (n <= 0)
                break;
            got += static_cast<size_t>(n);
        }
        options.head->resize(got);
    }
    if (!error)
        error = CopyRest(in.get(), out.get());
    if (!error && options.keepFileTimes) {
        const struct timespec times[2] = {st.st_atim, st.st_mtim};
        ::futimens(out.get(), times);
    }
    if (::close(out.release()) != 0 && !error)
        error = errno;
    if (error)
        ::unlink(target.c_str());
    return error;
}
