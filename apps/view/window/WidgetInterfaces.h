#pragma once

#include <QAccessible>

namespace ax::view {

// Makes the accessible objects of the window's own kinds of widgets; null for any other object. A factory as
// QAccessible takes them.
QAccessibleInterface* widgetInterface(const QString& className, QObject* object);

}  // namespace ax::view
