#pragma once

#include "dlf/DlfReader.h"
#include "support/Paths.h"

#include <fstream>
#include <iterator>
#include <string>
#include <vector>

namespace orvane
{

// The messages whose items are in a recording of the tests' data, in file order.
inline std::vector<Bytes> recordedMessages(const std::string& fileName)
{
    std::ifstream file(testDataPath(fileName), std::ios::binary);
    const std::vector<char> content{std::istreambuf_iterator<char>(file), {}};
    const Bytes bytes(content.begin(), content.end());
    std::vector<Bytes> messages;
    DlfReader reader(bytes);
    while (const auto item = reader.next()) {
        Bytes message = {item->type};
        message.insert(message.end(), item->bytes.begin(), item->bytes.end());
        messages.push_back(std::move(message));
    }
    return messages;
}

} // namespace orvane
