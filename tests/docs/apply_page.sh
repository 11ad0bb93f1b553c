#!/usr/bin/env bash
# Does what docs/adding-a-section.md tells its reader to do, in a folder of its own: writes the new
# files, and copies of the edited ones. What the reader types and sees goes to "typed" and "shown".
#   apply_page.sh PAGE ROOT_OF_THE_TREE FOLDER
#
# A line "<!-- new file: PATH -->" stands before a block that is the whole file, "<!-- edit: PATH -->"
# before one with lines of the file (a blank first) and lines to be added behind or between them ("+"
# first). The lines of the file must follow each other there, and only once.
set -euo pipefail
page=$1 root=$2 folder=$3

# Prints the block behind the line given.
block() {
    awk -v mark="$1" '
        $0 == mark { wanted = 1; next }
        wanted && /^```/ { if (inside) exit; inside = 1; next }
        inside' "$page"
}

# Applies the edit that is standard input to the file given.
edited() {
    awk -v edit="$(cat)" '
        { line[NR] = $0 }
        END {
            count = split(edit, step, "\n")
            for (i = 1; i <= count; ++i)
                if (step[i] !~ /^[+]/)
                    known[++knownCount] = substr(step[i], 2)
            for (start = 1; start + knownCount - 1 <= NR; ++start) {
                for (i = 1; i <= knownCount && line[start + i - 1] == known[i]; ++i)
                    ;
                if (i > knownCount) {
                    place = start
                    ++places
                }
            }
            if (places != 1 || !knownCount)
                exit 1
            for (i = 1; i < place; ++i)
                print line[i]
            next_line = place
            for (i = 1; i <= count; ++i)
                print step[i] ~ /^[+]/ ? substr(step[i], 2) : line[next_line++]
            for (i = next_line; i <= NR; ++i)
                print line[i]
        }' "$1"
}

while IFS= read -r mark; do
    path=${mark#*: } path=${path% -->}
    mkdir -p "$folder/$(dirname -- "$path")"
    case $mark in
    "<!-- new file: "*)
        if [ -e "$root/$path" ]; then
            echo "$page: $path already exists" >&2
            exit 1
        fi
        block "$mark" >"$folder/$path"
        ;;
    *)
        block "$mark" | edited "$root/$path" >"$folder/$path" || {
            echo "$page: the lines of the edit of $path are not in the file, or more than once" >&2
            rm "$folder/$path"
            exit 1
        }
        ;;
    esac
done < <(grep -E '^<!-- (new file|edit): .* -->$' "$page")
block "<!-- typed -->" >"$folder/typed"
block "<!-- shown -->" >"$folder/shown"
