#!/usr/bin/env bash
# What the pages show as a program's output is what the program prints: a block behind the line
# "<!-- printed by: COMMAND -->" equals the standard output of COMMAND, run at the root of the tree.
#   outputs_test.sh FOLDER_OF_THE_PROGRAMS
source "$(dirname -- "${BASH_SOURCE[0]}")/../scripts/harness.sh"
PATH=$1:$PATH
cd "$tree" || exit 1

for page in README.md CONTRIBUTING.md docs/*.md; do
    while IFS= read -r command; do
        case_named "$page: $command"
        shown=$(awk -v mark="<!-- printed by: $command -->" '
            $0 == mark { wanted = 1; next }
            wanted && /^```/ { inside = !inside; if (!inside) exit; next }
            inside' "$page")
        expect_equal "$(bash -c "$command" 2>/dev/null </dev/null)" "$shown"
    done < <(sed -n 's/^<!-- printed by: \(.*\) -->$/\1/p' "$page")
done
finish
