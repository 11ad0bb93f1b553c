#include "screens/terminal/TextEditor.h"

#include "screens/terminal/LineWidth.h"

#include <gtest/gtest.h>

namespace orvane
{

namespace
{

class TextEditorTest : public ::testing::Test
{
protected:
    void type(const std::string& text)
    {
        for (const char32_t character : decoded(text))
            editor.take(keyOfCharacter(character));
    }
    bool press(Key::Kind kind) { return editor.take(keyOfKind(kind)); }
    bool pressWithControl(char letter)
    {
        return editor.take(keyOfCharacter(static_cast<char32_t>(letter) & 0x1F));
    }
    // The text in a field of ten columns, and the cursor's column.
    std::pair<std::string, int> drawn()
    {
        Canvas canvas;
        canvas.grid = CellGrid(1, 12);
        editor.draw(canvas, 0, {1, 11}, {});
        EXPECT_TRUE(canvas.cursor.isVisible);
        return {canvas.grid.text(0), canvas.cursor.column};
    }

    TextEditor editor;
};

} // namespace

TEST_F(TextEditorTest, CharactersAreInsertedAtTheCursor)
{
    type("hd");
    press(Key::Kind::Left);
    type("ün");
    EXPECT_EQ(editor.text(), "hünd");
    press(Key::Kind::Home);
    type("世");
    press(Key::Kind::End);
    type("!");
    EXPECT_EQ(editor.text(), "世hünd!");
}

TEST_F(TextEditorTest, WhatCombinesGoesWithItsCharacter)
{
    type("ae\u0301b");
    press(Key::Kind::Left);
    press(Key::Kind::Backspace);
    EXPECT_EQ(editor.text(), "ab");
    type("o\u0302");
    press(Key::Kind::Left);
    press(Key::Kind::Delete);
    EXPECT_EQ(editor.text(), "ab");
}

TEST_F(TextEditorTest, ControlErasesToTheEndsAndWords)
{
    type("one two  three");
    pressWithControl('W');
    EXPECT_EQ(editor.text(), "one two  ");
    pressWithControl('W');
    EXPECT_EQ(editor.text(), "one ");
    type("more");
    pressWithControl('A');
    press(Key::Kind::Right);
    pressWithControl('K');
    EXPECT_EQ(editor.text(), "o");
    type("pq");
    press(Key::Kind::Left);
    pressWithControl('U');
    EXPECT_EQ(editor.text(), "q");
    pressWithControl('E');
    type("r");
    EXPECT_EQ(editor.text(), "qr");
}

TEST_F(TextEditorTest, AtTheEndsNothingIsErased)
{
    EXPECT_TRUE(press(Key::Kind::Backspace));
    type("a");
    EXPECT_TRUE(press(Key::Kind::Delete));
    press(Key::Kind::Left);
    press(Key::Kind::Left);
    EXPECT_TRUE(press(Key::Kind::Backspace));
    EXPECT_EQ(editor.text(), "a");
}

TEST_F(TextEditorTest, APasteComesInAsOneLine)
{
    Key key = keyOfKind(Key::Kind::Pasted);
    for (const char32_t character : std::u32string(U"a\nb\tc\x1b")) {
        key.character = character;
        EXPECT_TRUE(editor.take(key));
    }
    EXPECT_EQ(editor.text(), "a b c");
}

TEST_F(TextEditorTest, OtherKeysAreNotItsOwn)
{
    EXPECT_FALSE(press(Key::Kind::Enter));
    EXPECT_FALSE(press(Key::Kind::Up));
    EXPECT_FALSE(pressWithControl('R'));
    EXPECT_EQ(editor.text(), "");
}

TEST_F(TextEditorTest, ATextHasAnEnd)
{
    type(std::string(TextEditor::kLongest + 10, 'x'));
    EXPECT_EQ(editor.text().size(), TextEditor::kLongest);
}

TEST_F(TextEditorTest, ALongTextIsScrolledToTheCursor)
{
    type("abcdefghi");
    EXPECT_EQ(drawn(), std::pair(std::string(" abcdefghi"), 10));
    type("jkl");
    EXPECT_EQ(drawn(), std::pair(std::string(" defghijkl"), 10));
    press(Key::Kind::Home);
    EXPECT_EQ(drawn(), std::pair(std::string(" abcdefghij"), 1));
}

TEST_F(TextEditorTest, TheCursorCountsColumnsNotCharacters)
{
    type("世e\u0301");
    EXPECT_EQ(drawn(), std::pair(std::string(" 世e\u0301"), 4));
}

TEST_F(TextEditorTest, SettingTheSameTextLeavesTheCursor)
{
    type("abc");
    press(Key::Kind::Home);
    editor.setText("abc");
    type("x");
    EXPECT_EQ(editor.text(), "xabc");
    editor.setText("other");
    type("!");
    EXPECT_EQ(editor.text(), "other!");
}

} // namespace orvane
