#pragma once

#include "recordings/RowWriter.h"

#include <utility>

namespace orvane
{

// The paths that occur, a line each, as soon as all are known.
class PathListWriter final : public RowWriter
{
public:
    explicit PathListWriter(Output output) : _output(std::move(output)) {}

    bool takePeriod(const std::string&, const RowTable&) override { return true; }
    void finish(const RowTable& table) override;

private:
    Output _output;
};

} // namespace orvane
