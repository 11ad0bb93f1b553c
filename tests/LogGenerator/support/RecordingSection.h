#pragma once

#include "LogGenerator/ClassIndex.h"
#include "platform/base/PropertyValue.h"

#include <functional>
#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace orvane
{

// A section for tests: subscribes to the codes that it is given and keeps each call.
class RecordingSection final : public Base
{
public:
    struct Call {
        Bytes data;
        std::uint32_t logCode;
    };

    RecordingSection(std::string name, std::vector<std::uint32_t> codes,
                     PropertyValue::Type type = PropertyValue::Type::Dictionary)
        : _name(std::move(name)), _codes(std::move(codes)), _type(type)
    {
    }

    void updateWithData(ByteView data, std::uint32_t logCode) override
    {
        calls.push_back({Bytes(data.begin(), data.end()), logCode});
        if (onCall)
            onCall();
    }
    [[nodiscard]] std::string getSectionName() const override { return _name; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return _codes; }
    [[nodiscard]] PropertyValue::Type subtreeType() const override { return _type; }

    using Base::list;
    using Base::rows;

    std::vector<Call> calls;
    std::function<void()> onCall;

private:
    std::string _name;
    std::vector<std::uint32_t> _codes;
    PropertyValue::Type _type;
};

// An index of such sections.
class RecordingClassIndex final : public ClassIndex
{
public:
    RecordingSection& add(const std::string& name, std::vector<std::uint32_t> codes,
                          PropertyValue::Type type = PropertyValue::Type::Dictionary)
    {
        _sections.push_back(std::make_unique<RecordingSection>(name, std::move(codes), type));
        _sections.back()->initWithDict(classDict, codeDictionary);
        return *_sections.back();
    }

private:
    std::vector<std::unique_ptr<RecordingSection>> _sections;
};

} // namespace orvane
