#pragma once

#include <QString>

#include <string_view>

class QPoint;
class QRect;
class QWidget;

namespace orvane
{

// Qt takes some texts for rich text: a tool tip that holds a tag is drawn as HTML and loads the
// pictures that it names. Rows, titles, paths and remarks come from files and from the network, so
// every text reaches Qt through one of these functions, through TextLine, WrappedText or
// FlatButton::setText(), or is drawn by a painter, which knows no rich text.

// The text on one line, as printableText() makes it, cut after 4096 bytes.
QString lineOf(std::string_view text);

// What Qt must be given as a tool tip to show exactly the text.
QString plainToolTip(const QString& text);
void setPlainToolTip(QWidget& widget, const QString& text);
// Shows the tool tip now, or hides it if the text is empty. It goes once the pointer leaves `area`,
// which is in the widget's coordinates.
void showPlainToolTip(const QPoint& onScreen, const QString& text, QWidget& widget,
                      const QRect& area);

// The title of the widget's window: a "[*]" in it stays what it is.
void setPlainWindowTitle(QWidget& window, QString title);

} // namespace orvane
