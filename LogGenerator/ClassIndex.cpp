#include "LogGenerator/ClassIndex.h"

#include "platform/services/Console.h"
#include "platform/services/SystemLog.h"

#include <charconv>

namespace orvane
{

ClassIndex::~ClassIndex() { consoleLine("Deallocing ClassIndex"); }

void ClassIndex::init()
{
    for (Field* field : _fields) {
        field->_section = field->make();
        field->_section->initWithDict(classDict, codeDictionary);
    }
}

void ClassIndex::releaseSections()
{
    for (Field* field : _fields)
        field->_section.reset();
}

Base* ClassIndex::getClass(std::string_view name) const
{
    Base* const* section = classDict.find(name);
    return section ? *section : nullptr;
}

const std::vector<Base*>* ClassIndex::getSubscribers(std::uint32_t logCode) const
{
    if (_codesIndexed != codeDictionary.size()) {
        _subscribers.clear();
        for (const auto& [text, sections] : codeDictionary) {
            std::uint32_t code = 0;
            std::from_chars(text.data(), text.data() + text.size(), code);
            _subscribers.emplace(code, &sections);
        }
        _codesIndexed = codeDictionary.size();
    }
    const auto found = _subscribers.find(logCode);
    return found == _subscribers.end() ? nullptr : found->second;
}

std::vector<std::string> ClassIndex::getAllLogCodes() const
{
    std::vector<std::string> codes;
    for (const auto& [code, sections] : codeDictionary)
        codes.push_back(code);
    return codes;
}

void ClassIndex::status() const
{
    constexpr bool kIsDictionary = std::is_same_v<decltype(classDict), ClassDictionary>;
    constexpr bool kIsString = std::is_same_v<decltype(classDict), std::string>;
    logWarning("Dictionary = %d", kIsDictionary ? 1 : 0);
    logWarning("String = %d", kIsString ? 1 : 0);
}

} // namespace orvane
