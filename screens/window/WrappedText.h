#pragma once

#include "screens/toolkit/Font.h"

#include <QLabel>

namespace orvane
{

// Plain text, centred, on as many lines as it needs, in the theme's colour for its tone.
class WrappedText final : public QLabel
{
public:
    enum class Tone { Plain, Quiet, Warning };

    WrappedText(QWidget* parent, const Font& font, Tone tone = Tone::Plain);

protected:
    void changeEvent(QEvent* event) override;

private:
    void applyTheme();

    Tone _tone;
};

} // namespace orvane
