#!/usr/bin/env bash
# Every file that a page names exists: the targets of its links, and paths in backticks that begin
# with a folder of the tree.
source "$(dirname -- "${BASH_SOURCE[0]}")/../scripts/harness.sh"
cd "$tree" || exit 1

# Prints the paths in backticks on a page that begin with a folder of the tree or are scripts there.
# Words with a blank are not paths.
named_paths() {
    local folders
    folders=$(find . -mindepth 1 -maxdepth 1 -type d ! -name '.git' ! -name build -printf '%f|')
    # shellcheck disable=SC2016 # the backticks are the page's
    grep -oE '`[^` ]+`' "$1" | tr -d '`' | grep -E "^(\./)?(${folders%|})/" | sort -u
}

# Prints the files that the page tells its reader to make.
new_files() { sed -n 's/^<!-- new file: \(.*\) -->$/\1/p' "$1"; }

for page in README.md CONTRIBUTING.md docs/*.md; do
    case_named "the links of $page"
    while IFS= read -r target; do
        [ -e "$(dirname -- "$page")/$target" ] || fail "no file $target"
    done < <(grep -oE '\]\([^)#]+' "$page" | sed 's/^](//' | grep -v '^[a-z]*:' | sort -u)

    case_named "the paths on $page"
    while IFS= read -r path; do
        # A path may be a pattern such as *.cpp, or a class, whose header it names without its ending.
        # compgen takes any text with a slash at its end for a match.
        compgen -G "${path%/}" >/dev/null || [ -e "$path.h" ] || fail "no file $path"
    done < <(named_paths "$page" | grep -vxFf <(new_files "$page"))
done
finish
