#pragma once

class QString;
class QWidget;

/// A field of a form with its caption above it, which names it for assistive programs as well.
QWidget *captioned(const QString &caption, QWidget *field, QWidget *parent);
