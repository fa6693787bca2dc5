// SPDX-License-Identifier: Apache-2.0
// Eyes and hands on the viewer's window: what it shows, and keys and clicks as a user would give them.
#pragma once

#include <QJsonObject>
#include <QKeySequence>
#include <QString>

namespace kelvasi {

class TableWidget;

// Whether the window is there and nothing slides over it.
bool isWindowStill();

// The top pane under "title", "back" (empty at the root), "status", "busy" and "rows", the
// texts of the buttons that can be used under "buttons", the save view under "saveView" and the alert under
// "alert", what the cockpit knows and shows under "cockpit", and what a notice says of a file under "notice"
// (each null where there is none). A row is the list of its texts; only rows in sight are listed.
QJsonObject shownState();
QString shownStatus();
// Whether there is no way back.
bool isAtRoot();

// The table of the top pane, or of the save view where it is open.
TableWidget* shownTable();
// Whether a row in sight holds a value that is wider than the window.
bool showsWideValue();
// Scrolls the first such value a little way.
void scrollWideValue();

// Goes to the row whose first text is `name`, by keyboard. False when the table has none.
bool goToRow(const QString& name);
// Opens the row at which the keyboard is.
void openRow();
void press(const QKeySequence& keys);
void type(const QString& text);
// So many times before anything that a click posted is done. False when no button that can be used has this
// text.
bool click(const QString& text, int times);

// In the resolution of the screen; the name's ending says in which format. False when it cannot be written.
bool savePicture(const QString& path);

}  // namespace kelvasi
