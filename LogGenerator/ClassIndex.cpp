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
    char key[16];
    const auto end = std::to_chars(key, key + sizeof key, logCode).ptr;
    return codeDictionary.find(std::string_view(key, static_cast<std::size_t>(end - key)));
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
