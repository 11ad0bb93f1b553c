#include "recordings/SnapshotTree.h"

#include "platform/base/PropertyValue.h"

#include "recordings/support/LogFiles.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using testing::ElementsAre;

Snapshot::Entry entry(const std::string& description, const std::string& date,
                      const PropertyValue& display = {})
{
    Snapshot::Entry made;
    made.description = description;
    made.date = date;
    made.display = display;
    return made;
}

std::vector<std::string> names(const NodePointer& node)
{
    std::vector<std::string> found;
    for (const NodePointer& child : *node->childNodes())
        found.push_back(child->displayName());
    return found;
}

TEST(SnapshotTreeTest, EntriesAreGroupsBesideWhatTheUserWrote)
{
    Snapshot snapshot;
    snapshot.timestamp = "2026-11-21 10:00:06 +0000";
    snapshot.description = "by the river";
    snapshot.entries = {
        entry("Snapshot (2026-11-21 10:00:00 +0000)", "2026-11-21 10:00:00 +0000",
              PropertyValue::dictionaryOf({{"Cell ID", "7"}}
              ))
    };
    snapshot.entries.push_back(entry("DLF binary (161 bytes)", ""));
    snapshot.entries.back().log = sourceOf({});
    const SnapshotTree tree(snapshot);
    EXPECT_EQ(tree.root(), tree.nodeAtPath("/"));
    EXPECT_THAT(names(tree.root()),
                ElementsAre("Description", "Saved", "Snapshot (2026-11-21 10:00:00 +0000)",
                            "DLF binary (161 bytes)"));
    EXPECT_EQ(*tree.nodeAtPath("/Description")->value(), "by the river");
    EXPECT_EQ(*tree.nodeAtPath("/Saved")->value(), "2026-11-21 10:00:06 +0000");
    const std::string group = "/Snapshot (2026-11-21 10:00:00 +0000)";
    EXPECT_EQ(*tree.nodeAtPath(group + "/Cell ID")->value(), "7");
    EXPECT_EQ(tree.nodeAtPath(group + "/Other"), nullptr);
    EXPECT_TRUE(tree.nodeAtPath("/DLF binary (161 bytes)")->childNodes()->empty());

    ASSERT_TRUE(tree.groupOf(group + "/Cell ID"));
    EXPECT_EQ(tree.groupOf(group + "/Cell ID")->path, group);
    EXPECT_EQ(tree.groupOf(group)->date, "2026-11-21 10:00:00 +0000");
    EXPECT_FALSE(tree.groupOf(group)->log);
    EXPECT_TRUE(tree.groupOf("/DLF binary (161 bytes)/Serving Cell Info")->log);
    EXPECT_EQ(tree.groupOf("/"), nullptr);
    EXPECT_EQ(tree.groupOf("/Description"), nullptr);
    EXPECT_EQ(tree.groupOf(group + "x"), nullptr);
}

TEST(SnapshotTreeTest, EntriesAreNamedByDescriptionAndDateEachNameOnce)
{
    Snapshot snapshot;
    snapshot.entries = {
        entry("a", ""),       entry("a", ""), entry("a", "at noon"), entry("a at noon", "at noon"),
        entry("", "at noon"), entry("", ""),  entry("", ""),         entry("Saved", "")};
    const SnapshotTree tree(snapshot);
    EXPECT_THAT(names(tree.root()),
                ElementsAre("Description", "Saved", "a", "a 2", "a (at noon)", "a at noon",
                            "(at noon)", "Entry", "Entry 2", "Saved 2"));
}

TEST(SnapshotTreeTest, PathsAreWithinAGroupPartByPart)
{
    EXPECT_TRUE(isWithin("/a", "/a"));
    EXPECT_TRUE(isWithin("/a/b", "/a"));
    EXPECT_FALSE(isWithin("/ab", "/a"));
    EXPECT_FALSE(isWithin("/", "/a"));
    EXPECT_TRUE(isWithin("/a", "/"));
    EXPECT_TRUE(isWithin("/", "/"));
}

// A quadratic tree would take hours for these.
TEST(SnapshotTreeTest, ManyEntriesOfOneNameAreNumbered)
{
    constexpr std::size_t kEntries = 100'000;
    Snapshot snapshot;
    snapshot.entries.assign(kEntries, entry("same", ""));
    const SnapshotTree tree(snapshot);
    EXPECT_EQ(tree.root()->childNodes()->size(), kEntries + 2);
    for (const char* path : {"/same", "/same 2", "/same 100000"})
        EXPECT_NE(tree.nodeAtPath(path), nullptr) << path;
    EXPECT_EQ(tree.nodeAtPath("/same 100001"), nullptr);
}

TEST(SnapshotTreeTest, ANumberedNameThatIsTakenIsPassedOver)
{
    Snapshot snapshot;
    snapshot.entries = {entry("a 2", ""), entry("a", ""), entry("a", ""), entry("a", "")};
    EXPECT_THAT(names(SnapshotTree(snapshot).root()),
                ElementsAre("Description", "Saved", "a 2", "a", "a 3", "a 4"));
}

} // namespace
} // namespace orvane
