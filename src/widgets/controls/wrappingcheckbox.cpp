#include "widgets/controls/wrappingcheckbox.h"

#include "widgets/style/theme.h"

#include <QStyleOptionButton>
#include <QStylePainter>

namespace {
constexpr int gap = 12;
constexpr int minTextWidth = 160;
constexpr int padding = 4;
constexpr int flags = Qt::AlignLeft | Qt::AlignTop | Qt::TextWordWrap;
} // namespace

WrappingCheckBox::WrappingCheckBox(const QString &text, QWidget *parent) : QCheckBox(text, parent) {
    // A fixed height would be that of one line.
    QSizePolicy policy(QSizePolicy::Preferred, QSizePolicy::Minimum);
    policy.setHeightForWidth(true);
    setSizePolicy(policy);
}

int WrappingCheckBox::textLeft() const {
    return style()->pixelMetric(QStyle::PM_IndicatorWidth, nullptr, this) + gap;
}

QSize WrappingCheckBox::minimumSizeHint() const {
    return {textLeft() + minTextWidth, fontMetrics().height() + 2 * padding};
}

int WrappingCheckBox::heightForWidth(int width) const {
    const QRect room(0, 0, width - textLeft(), 10000);
    return fontMetrics().boundingRect(room, flags, text()).height() + 2 * padding;
}

void WrappingCheckBox::paintEvent(QPaintEvent *) {
    QStyleOptionButton option;
    initStyleOption(&option);
    option.text.clear();
    option.rect.setHeight(fontMetrics().height() + 2 * padding);
    QStylePainter painter(this);
    painter.drawControl(QStyle::CE_CheckBox, option);
    painter.setPen(!isEnabled() ? Theme::textOff : hasFocus() ? Theme::text : Theme::textDim);
    painter.drawText(rect().adjusted(textLeft(), padding, 0, 0), flags, text());
    if (hasFocus()) {
        const QRect line =
            fontMetrics().boundingRect(rect().adjusted(textLeft(), padding, 0, 0), flags, text());
        painter.drawLine(line.bottomLeft(), line.bottomRight());
    }
}
