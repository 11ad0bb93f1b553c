#!/usr/bin/env bash
# tools/install-hooks installs a hook that refuses commits of badly formatted or forbidden sources.
source "$(dirname -- "${BASH_SOURCE[0]}")/harness.sh"
if ! clang-format --version 2>/dev/null | grep -q 'version 14\.'; then
    echo "clang-format 14 is not installed"
    exit 77
fi
if ! command -v git >/dev/null; then
    echo "git is not installed"
    exit 77
fi
# Not the repository and the settings of the user who runs the tests.
# shellcheck disable=SC2046
unset $(git rev-parse --local-env-vars)
export HOME=$scratch GIT_CONFIG_NOSYSTEM=1
clone=$scratch/clone
mkdir -p "$clone/tools"
cd "$clone" || exit 1
cp -r "$tree"/tools/{check-format,check-sources,list-sources,install-hooks,hooks} tools/
cp "$tree/.clang-format" .
git init -q .
git config user.name Somebody
git config user.email somebody@example.org

# Commits the index; sets output and status.
commit() {
    output=$(git commit -q -m "$1" 2>&1) && status=0 || status=$?
}
commits() { git rev-list --count --all; }

case_named "it is installed once"
output=$(cd / && "$clone/tools/install-hooks" 2>&1) && status=0 || status=$?
expect_equal "$status|$output" "0|Installed: each commit now checks format and sources."
output=$(tools/install-hooks 2>&1) && status=0 || status=$?
expect_equal "$status|$output" "0|The hooks are already installed."

case_named "what is right is committed without a word"
put app/Good.cpp <<<'int good() { return 1; }'
git add -A
commit "Add a good file"
expect_equal "$status|$output|$(commits)" "0||1"

case_named "a badly formatted file is named and not committed"
put app/Bad.cpp <<<'int  bad( ){return 1;}'
git add -A
commit "Add a bad file"
expect_equal "$status|$(commits)" "1|1"
expect_contains "$output" "app/Bad.cpp:1: not formatted"
expect_contains "$output" "Nothing was committed."

case_named "the index counts, not the work tree"
tools/check-format --fix
commit "Add a file that is only repaired in the work tree"
expect_equal "$status|$(commits)" "1|1"
git add -A
put app/Bad.cpp <<<'int  bad( ){return 1;}'
commit "Add a repaired file"
expect_equal "$status|$(commits)" "0|2"

case_named "a broken rule of the sources is named and not committed"
put app/Bad.cpp <<<$'#include "absent/Header.h"'
git add -A
commit "Include a header that does not exist"
expect_equal "$status|$(commits)" "1|2"
expect_contains "$output" "app/Bad.cpp:1: no such header"

case_named "hooks of somebody else stay"
git config core.hooksPath elsewhere
output=$(tools/install-hooks 2>&1) && status=0 || status=$?
expect_equal "$status|$(git config core.hooksPath)" "1|elsewhere"
expect_contains "$output" "already uses the hooks in \"elsewhere\""

finish
