#pragma once

#include <cerrno>
#include <unistd.h>
#include <utility>

/// An open descriptor, closed with this object. Closing leaves `errno` alone.
class Descriptor {
public:
    explicit Descriptor(int opened = -1) : number(opened) {}
    Descriptor(Descriptor &&other) noexcept : number(std::exchange(other.number, -1)) {}
    Descriptor &operator=(Descriptor &&other) noexcept {
        std::swap(number, other.number);
        return *this;
    }
    Descriptor(Descriptor const &) = delete;
    Descriptor &operator=(Descriptor const &) = delete;
    ~Descriptor() { Close(); }

    bool IsOpen() const { return number >= 0; }
    int Get() const { return number; }
    void Close() {
        int const error = errno;
        if (number >= 0)
            ::close(std::exchange(number, -1));
        errno = error;
    }

private:
    int number;
};
