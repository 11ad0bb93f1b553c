#pragma once

#include <memory>

namespace orvane
{

// Qt's application object for a program with a window. Made before the event loop, one at a time,
// in the main thread. Where there is no display, ends the process with status 1 and a word on
// standard error.
class QtWindowApplication
{
public:
    QtWindowApplication();
    ~QtWindowApplication();
    QtWindowApplication(const QtWindowApplication&) = delete;
    QtWindowApplication& operator=(const QtWindowApplication&) = delete;

private:
    struct Parts;
    std::unique_ptr<Parts> _parts;
};

} // namespace orvane
