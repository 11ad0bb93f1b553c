#include "screens/window/Theme.h"

#include "screens/window/DesktopColours.h"
#include "screens/window/WindowTest.h"

#include <algorithm>
#include <cmath>
#include <utility>

namespace orvane
{

namespace
{

constexpr double kReadable = 4.5;

double linear(double channel)
{
    return channel <= 0.04045 ? channel / 12.92 : std::pow((channel + 0.055) / 1.055, 2.4);
}

// Relative luminance, 0 for black to 1 for white.
double luminance(const QColor& colour)
{
    return 0.2126 * linear(colour.redF()) + 0.7152 * linear(colour.greenF()) +
           0.0722 * linear(colour.blueF());
}

// 1 for equal colours to 21 for black on white.
double contrast(const QColor& one, const QColor& other)
{
    const auto [dark, light] = std::minmax({luminance(one), luminance(other)});
    return (light + 0.05) / (dark + 0.05);
}

TEST(ContrastTest, IsMeasuredAsTheGuidelinesForAccessibilitySay)
{
    EXPECT_NEAR(contrast(Qt::black, Qt::white), 21, 1e-9);
    EXPECT_NEAR(contrast(QColor(0x77, 0x77, 0x77), Qt::white), 4.48, 0.005);
    EXPECT_NEAR(contrast(Qt::red, Qt::red), 1, 1e-9);
}

TEST(ThemeTest, EveryTextCanBeReadOnEverythingBehindIt)
{
    for (const Theme* theme : {&Theme::light(), &Theme::dark()}) {
        const std::pair<const char*, QColor> fronts[] = {
            {"text",      theme->text     },
            {"quietText", theme->quietText},
            {"accent",    theme->accent   },
            {"warning",   theme->warning  }
        };
        const std::pair<const char*, QColor> backs[] = {
            {"background", theme->background},
            {"bar",        theme->bar       },
            {"pressed",    theme->pressed   },
            {"badge",      theme->badge     }
        };
        for (const auto& [front, colour] : fronts)
            for (const auto& [back, behind] : backs)
                EXPECT_GE(contrast(colour, behind), kReadable)
                    << front << " on " << back << (theme == &Theme::dark() ? ", dark" : ", light");
    }
}

TEST(ThemeTest, PalettesForTheDesktopsSchemeCanBeRead)
{
    QPalette light;
    light.setColor(QPalette::Window, Qt::white);
    QPalette dark;
    dark.setColor(QPalette::Window, Qt::black);
    using Scheme = DesktopColours::Scheme;
    for (const QPalette& palette : {DesktopColours::paletteFor(Scheme::Dark, light),
                                    DesktopColours::paletteFor(Scheme::Light, dark)}) {
        using Roles = std::pair<QPalette::ColorRole, QPalette::ColorRole>;
        for (const auto& [text, behind] :
             {Roles(QPalette::WindowText, QPalette::Window), Roles(QPalette::Text, QPalette::Base),
              Roles(QPalette::ButtonText, QPalette::Button),
              Roles(QPalette::ToolTipText, QPalette::ToolTipBase),
              Roles(QPalette::PlaceholderText, QPalette::Base),
              Roles(QPalette::HighlightedText, QPalette::Highlight)})
            EXPECT_GE(contrast(palette.color(text), palette.color(behind)), kReadable)
                << text << " on " << behind;
    }
}

} // namespace

} // namespace orvane
