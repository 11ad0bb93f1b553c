#pragma once

#include <string>

namespace orvane
{

struct Font {
    std::string family; // empty for the system's font
    double size = 17;   // points
    bool isBold = false;

    static Font system(double size) { return {"", size, false}; }
    static Font boldSystem(double size) { return {"", size, true}; }
    friend bool operator==(const Font&, const Font&) = default;
};

} // namespace orvane
