#pragma once

#include "screens/toolkit/Font.h"

#include <QLabel>

namespace orvane
{

// Text in the middle of as many lines as it takes, in the theme's colour.
class WrappedText final : public QLabel
{
public:
    enum class Tone { Plain, Quiet };

    WrappedText(QWidget* parent, const Font& font, Tone tone = Tone::Plain);

protected:
    void changeEvent(QEvent* event) override;

private:
    void applyTheme();

    Tone _tone;
};

} // namespace orvane
