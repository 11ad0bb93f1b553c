#!/usr/bin/env bash
# tools/check-sources finds each kind of broken rule, names its place, and reports nothing else.
source "$(dirname -- "${BASH_SOURCE[0]}")/harness.sh"

# A small tree that keeps every rule.
make_tree() {
    rm -rf "$scratch/tree"
    mkdir "$scratch/tree"
    cd "$scratch/tree" || exit 1
    put platform/Value.h <<<'#pragma once'
    put platform/plist/Xml.cpp <<<'#include <expat.h>'
    put ui/panes/Pane.h <<<$'#pragma once\n#include "platform/Value.h"\n#include <vector>'
    put app/Shell.h <<<$'#pragma once\n#include "ui/panes/Pane.h"\n#include "platform/Value.h"'
    put app/main.cpp <<<'#include "platform/linux/Loop.h"'
    put app/program/FrontEnd.cpp <<<'#include "platform/linux/Loop.h"'
    put platform/linux/Loop.h <<<$'#pragma once\n#include "platform/Value.h"\n#include <QObject>'
    put screens/window/Row.h <<<$'#pragma once\n#include <QWidget>'
    put tests/screens/window/Row_test.cpp <<<'#include <QTest>'
    put tests/support/Helper.cpp <<<'#include "support/Helper.h"'
    put tests/support/Helper.h <<<'#pragma once'
    put fuzz/Target.h <<<'#pragma once'
    put fuzz/values.cpp <<<'#include "Target.h"'
    put tests/app/Shell_test.cpp <<<$'#include "app/Shell.h"\n#include "support/Helper.h"'
}

check() { complaints=$("$tree/tools/check-sources" . 2>&1) && status=0 || status=$?; }

# expect_complaint FILE LINES WHERE WHAT: with that file in the tree, exactly this is complained of.
expect_complaint() {
    case_named "$4 ($1)"
    make_tree
    put "$1" <<<"$2"
    check
    expect_equal "$status" 1
    expect_equal "$(wc -l <<<"$complaints")" 1
    expect_contains "$complaints" "$3: $4"
}

case_named "a tree that keeps the rules"
make_tree
check
expect_equal "$complaints" ""
expect_equal "$status" 0

once=$'#pragma once\n'
expect_complaint app/Other.h "$once#include \"../ui/panes/Pane.h\"" app/Other.h:2 "an include starts at the root"
expect_complaint app/Other.h "$once#include \"./Shell.h\"" app/Other.h:2 "an include starts at the root"
expect_complaint app/Other.h "$once#include \"ui/../ui/panes/Pane.h\"" app/Other.h:2 "an include starts at the root"
expect_complaint app/Other.cpp '#include "Shell.h"' app/Other.cpp:1 "no such header"
expect_complaint app/Other.cpp '#include <QTimer>' app/Other.cpp:1 "Qt is for platform/linux/ and screens/window/ alone"
expect_complaint app/main.cpp '#include <QCoreApplication>' app/main.cpp:1 "Qt is for platform/linux/ and screens/window/ alone"
expect_complaint tests/app/Other_test.cpp '#  include <QtCore/QTimer>' tests/app/Other_test.cpp:1 "Qt is for platform/linux/ and screens/window/ alone"
expect_complaint ui/Other.cpp '#include <ncurses.h>' ui/Other.cpp:1 "ncurses is for screens/terminal/ alone"
expect_complaint ui/Other.cpp '#include <ncursesw/curses.h>' ui/Other.cpp:1 "ncurses is for screens/terminal/ alone"
expect_complaint platform/Other.cpp '#include <expat.h>' platform/Other.cpp:1 "Expat is for"
for class in QToolTip QLabel QMessageBox QtWidgets/QMenu QSystemTrayIcon; do
    expect_complaint screens/window/Other.cpp "#include <$class>" screens/window/Other.cpp:1 "this class takes some texts for rich text or shortcuts"
done
for call in '_bar->setToolTip(name)' 'setWindowTitle (title);' 'widget.setWhatsThis(text)'; do
    expect_complaint screens/window/Other.cpp "    $call" screens/window/Other.cpp:1 "Qt takes some texts for rich text"
done
expect_complaint app/Other.h '#include <vector>' app/Other.h:1 "a header begins with #pragma once"
expect_complaint app/Other.h "$once using namespace std;" app/Other.h:2 "a header opens no namespace"
expect_complaint app/Other.cpp '// TO''DO: later' app/Other.cpp:1 "what is left to do"
expect_complaint tests/app/Other_tests.cpp $'\nTEST_F(Shell, Opens)' tests/app/Other_tests.cpp:2 "a test in a file whose name"

case_named "every broken rule of a tree is named"
make_tree
put ui/One.cpp <<<$'#include <QTimer>\n#include "Shell.h"'
put ui/Two.h <<<'#include <ncurses.h>'
check
expect_equal "$(cut -d: -f1,2 <<<"$complaints")" $'ui/One.cpp:1\nui/One.cpp:2\nui/Two.h:1\nui/Two.h:1'

case_named "texts reach Qt through the files that show them as they are"
make_tree
put screens/window/PlainText.cpp <<<$'#include <QToolTip>\nwidget.setToolTip(plainToolTip(text));'
put screens/window/WrappedText.h <<<$'#pragma once\n#include <QLabel>'
put screens/window/Other.cpp <<<$'setPlainToolTip(*this, text);\nsetPlainWindowTitle(*this, text);\n#include <QLineEdit>'
put tests/screens/window/Tip_test.cpp <<<$'#include <QToolTip>'
check
expect_equal "$complaints" ""
expect_equal "$status" 0

case_named "what the build makes and what is ignored are nobody's"
make_tree
put build/dev/Bad.h <<<'#include <QTimer>'
put platform/linux/Loop.cpp <<<'#include "Loop.moc"'
check
expect_equal "$complaints" ""

if type -P git >/dev/null; then
    case_named "git's view of the tree: new files count, ignored and removed ones do not"
    make_tree
    git init -q . && put .gitignore <<<'/ignored/'
    put ignored/Bad.h <<<'#include <QTimer>'
    git add . && rm platform/linux/Loop.h app/main.cpp app/program/FrontEnd.cpp
    put ui/New.cpp <<<'#include <QTimer>'
    check
    expect_equal "$(cut -d: -f1 <<<"$complaints")" "ui/New.cpp"
fi

finish
