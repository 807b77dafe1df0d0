#pragma once

#include <QPoint>
#include <QString>
#include <QWidget>

namespace marlowbeck {

// What a hand does at a mouse and a keyboard, as events on widgets.

void PressMouse(QWidget& widget, QPoint at, Qt::KeyboardModifiers modifiers = Qt::NoModifier);
void ReleaseMouse(QWidget& widget, QPoint at, Qt::KeyboardModifiers modifiers = Qt::NoModifier);
void ClickMouse(QWidget& widget, QPoint at, Qt::KeyboardModifiers modifiers = Qt::NoModifier);
/// The second click of a double click.
void ClickMouseAgain(QWidget& widget, QPoint at);
void MoveMouse(QWidget& widget, QPoint at);
/// Presses the button, and lets it go beside the widget: brings the focus and clicks on nothing.
void PressAndLeave(QWidget& widget, QPoint at);

void KeyDown(QWidget& widget, int key, Qt::KeyboardModifiers modifiers = Qt::NoModifier,
             const QString& text = {});
void KeyUp(QWidget& widget, int key, Qt::KeyboardModifiers modifiers = Qt::NoModifier,
           const QString& text = {});
/// Down and up again.
void PressKey(QWidget& widget, int key, Qt::KeyboardModifiers modifiers = Qt::NoModifier,
              const QString& text = {});
/// Replaces the text of an entry.
void TypeOver(QWidget& entry, const QString& text);

/// Lets everything happen that is still to come of what was done.
void SettleEvents();

}  // namespace marlowbeck
