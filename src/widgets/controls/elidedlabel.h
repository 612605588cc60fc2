#pragma once

#include <QLabel>

/// A label of one line that gives way: where its text does not fit, an ellipsis tells so and a tool tip shows
/// the whole.
class ElidedLabel : public QLabel {
    Q_OBJECT

public:
    explicit ElidedLabel(QWidget *parent = nullptr);

    QSize minimumSizeHint() const override;

protected:
    void paintEvent(QPaintEvent *event) override;
    bool event(QEvent *event) override;
};
