#pragma once

#include "recordings/RowWriter.h"

#include <utility>

namespace orvane
{

// One JSON object a line: {"time":TIME,PATH:TEXT,...}, with the rows that are there, and without a
// time where it is not known.
class JsonRowWriter final : public RowWriter
{
public:
    explicit JsonRowWriter(Output output) : _output(std::move(output)) {}

    bool takePeriod(const std::string& time, const RowTable& table) override;

private:
    Output _output;
    std::string _line; // kept for its memory
};

} // namespace orvane
