#include "widgets/controls/flowlayout.h"

#include <QWidget>

#include <algorithm>

FlowLayout::FlowLayout(QWidget *parent) : QLayout(parent) {
    setContentsMargins(0, 0, 0, 0);
}

FlowLayout::~FlowLayout() = default;

void FlowLayout::addItem(QLayoutItem *item) {
    m_items.emplace_back(item);
}

void FlowLayout::addLayout(QLayout *layout) {
    addChildLayout(layout);
    addItem(layout);
}

QLayoutItem *FlowLayout::itemAt(int index) const {
    return index >= 0 && index < count() ? m_items[static_cast<std::size_t>(index)].get() : nullptr;
}

QLayoutItem *FlowLayout::takeAt(int index) {
    if (!itemAt(index))
        return nullptr;
    QLayoutItem *item = m_items[static_cast<std::size_t>(index)].release();
    m_items.erase(m_items.begin() + index);
    return item;
}

template <typename Place>
int FlowLayout::goThrough(const QRect &rect, Place place) const {
    const QRect room = rect.marginsRemoved(contentsMargins());
    int top = room.top();
    auto item = m_items.begin();
    while (item != m_items.end()) {
        // A line takes what fits, and one item at least.
        int width = 0;
        int height = 0;
        const auto first = item;
        for (; item != m_items.end(); ++item) {
            const QSize size = (*item)->isEmpty() ? QSize() : (*item)->sizeHint();
            if (size.isEmpty())
                continue;
            if (width > 0 && width + spacing() + size.width() > room.width())
                break;
            width += (width > 0 ? spacing() : 0) + size.width();
            height = std::max(height, size.height());
        }
        int left = room.left();
        for (auto each = first; each != item; ++each) {
            if ((*each)->isEmpty())
                continue;
            const QSize size = (*each)->sizeHint();
            place(**each, QRect(left, top, std::min(size.width(), room.width()), height));
            left += size.width() + spacing();
        }
        top += height + (item != m_items.end() ? spacing() : 0);
    }
    return top - room.top() + contentsMargins().top() + contentsMargins().bottom();
}

int FlowLayout::heightForWidth(int width) const {
    return goThrough(QRect(0, 0, width, 0), [](QLayoutItem &, const QRect &) {});
}

QSize FlowLayout::sizeHint() const {
    QSize size(0, 0);
    for (const auto &item : m_items) {
        if (item->isEmpty())
            continue;
        const QSize hint = item->sizeHint();
        size = {size.width() + (size.width() > 0 ? spacing() : 0) + hint.width(),
                std::max(size.height(), hint.height())};
    }
    return size.grownBy(contentsMargins());
}

QSize FlowLayout::minimumSize() const {
    QSize size(0, 0);
    for (const auto &item : m_items) {
        if (!item->isEmpty())
            size = size.expandedTo(item->minimumSize());
    }
    return size.grownBy(contentsMargins());
}

void FlowLayout::setGeometry(const QRect &rect) {
    QLayout::setGeometry(rect);
    goThrough(rect, [](QLayoutItem &item, const QRect &place) { item.setGeometry(place); });
}
