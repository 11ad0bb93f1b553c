#pragma once

#include "LogGenerator/Base.h"

#include <memory>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace orvane
{

// The registry through which a generator finds the sections for a log code and for a template key.
// Each technology has a subclass with one `Owned` field for each section.
class ClassIndex
{
public:
    ClassIndex() = default;
    virtual ~ClassIndex();
    ClassIndex(const ClassIndex&) = delete;
    ClassIndex& operator=(const ClassIndex&) = delete;

    // Makes and registers the sections, in the order of the subclass's fields.
    void init();

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
    // A field of a subclass, which owns one section from init() to releaseSections().
    class Field
    {
    public:
        explicit Field(ClassIndex& index) { index._fields.push_back(this); }
        virtual ~Field() = default;
        Field(const Field&) = delete;
        Field& operator=(const Field&) = delete;

    private:
        friend class ClassIndex;
        [[nodiscard]] virtual std::unique_ptr<Base> make() const = 0;

        std::unique_ptr<Base> _section;
    };

    template <typename Section>
    class Owned final : public Field
    {
    public:
        using Field::Field;

    private:
        [[nodiscard]] std::unique_ptr<Base> make() const override
        {
            return std::make_unique<Section>();
        }
    };

    // For a subclass's destructor: releases the sections in the order of the fields, which C++
    // would destroy in the opposite order.
    void releaseSections();

    ClassDictionary classDict;
    CodeDictionary codeDictionary;

private:
    std::vector<Field*> _fields;
    // The entries of codeDictionary by number, found as long as it has as many.
    mutable std::unordered_map<std::uint32_t, const std::vector<Base*>*> _subscribers;
    mutable std::size_t _codesIndexed = 0;
};

} // namespace orvane
