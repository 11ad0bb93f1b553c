#include "screens/terminal/TerminalKind.h"

#include <algorithm>
#include <cctype>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <curses.h>
#include <langinfo.h>
#include <locale.h> // NOLINT(modernize-deprecated-headers): newlocale() is not in <clocale>
#include <string_view>
#include <term.h>
#include <unistd.h>

namespace orvane
{

namespace
{

std::string variable(const char* name)
{
    const char* value = std::getenv(name);
    return value ? value : "";
}

bool localeHasUtf8()
{
    if (const locale_t locale = newlocale(LC_CTYPE_MASK, "", nullptr)) {
        const std::string codeset = nl_langinfo_l(CODESET, locale);
        freelocale(locale);
        return codeset == "UTF-8";
    }
    // One that this machine does not have; its name tells, as over ssh.
    std::string name = variable("LC_ALL");
    for (const char* next : {"LC_CTYPE", "LANG"})
        if (name.empty())
            name = variable(next);
    std::transform(name.begin(), name.end(), name.begin(),
                   [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
    return name.find("utf-8") != std::string::npos || name.find("utf8") != std::string::npos;
}

// A capability's text without its pauses, which only old hardware needs.
std::string capability(const char* name)
{
    const char* text = tigetstr(name);
    if (!text || text == reinterpret_cast<const char*>(-1))
        return "";
    std::string result;
    for (std::string_view rest = text; !rest.empty();) {
        if (rest.starts_with("$<") && rest.find('>') != std::string_view::npos) {
            rest.remove_prefix(rest.find('>') + 1);
            continue;
        }
        result += rest.front();
        rest.remove_prefix(1);
    }
    return result;
}

} // namespace

std::optional<std::string> terminalProblem()
{
    if (!::isatty(STDIN_FILENO) || !::isatty(STDOUT_FILENO))
        return "--ui terminal needs a terminal at standard input and output: use --ui text";
    const std::string name = variable("TERM");
    const std::string advice = ": set TERM to the terminal's kind, or use --ui text";
    if (name.empty())
        return "the kind of terminal is not known, TERM is not set" + advice;
    int error = 0;
    if (setupterm(name.c_str(), STDOUT_FILENO, &error) != OK)
        return "this system does not know the terminal \"" + name + "\"" + advice;
    const bool canMoveCursor = !capability("cup").empty();
    del_curterm(cur_term);
    if (!canMoveCursor)
        return "a terminal \"" + name + "\" cannot move its cursor" + advice;
    return std::nullopt;
}

TerminalKind::TerminalKind()
    : hasUtf8(localeHasUtf8()), isPlainConsole(variable("TERM").starts_with("linux")),
      pasteOn(capability("BE")), pasteOff(capability("BD"))
{
}

std::string TerminalKind::restoring(bool hasMouse) const
{
    std::string text = pasteOff;
    if (hasMouse)
        text += "\033[?1006l\033[?1000l";
    text += capability("rmkx") + capability("sgr0") + capability("cnorm");
    const std::string leaving = capability("rmcup");
    if (!leaving.empty())
        return text + leaving;
    // The program's last screen stays; what comes next goes below.
    return text + tiparm(tigetstr("cup"), 998, 0) + "\r\n";
}

void TerminalKind::send(const std::string& text) const
{
    if (text.empty())
        return;
    putp(text.c_str());
    std::fflush(stdout);
}

} // namespace orvane
