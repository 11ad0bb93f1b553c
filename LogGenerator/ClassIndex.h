#pragma once

#include "LogGenerator/Base.h"

#include <memory>
#include <string_view>
#include <vector>

namespace orvane
{

// The registry through which a generator finds the sections for a log code and for a template key.
// Each technology has a subclass whose `init` makes its sections.
class ClassIndex
{
public:
    ClassIndex() = default;
    virtual ~ClassIndex();
    ClassIndex(const ClassIndex&) = delete;
    ClassIndex& operator=(const ClassIndex&) = delete;

    // The section of that name, or null.
    [[nodiscard]] Base* getClass(std::string_view name) const;
    // The sections that subscribe to the code, in registration order, or null when none does.
    [[nodiscard]] const std::vector<Base*>* getSubscribers(std::uint32_t logCode) const;
    // All subscribed codes as decimal texts, in registration order.
    [[nodiscard]] std::vector<std::string> getAllLogCodes() const;
    // A diagnostic aid: logs what the section dictionary is.
    void status() const;

    [[nodiscard]] const ClassDictionary& sections() const { return classDict; }

protected:
    // Makes a section and registers it.
    template <typename Section>
    std::unique_ptr<Section> make()
    {
        auto section = std::make_unique<Section>();
        section->initWithDict(classDict, codeDictionary);
        return section;
    }

    ClassDictionary classDict;
    CodeDictionary codeDictionary;
};

} // namespace orvane
