#pragma once

#include <QLayout>

#include <memory>
#include <vector>

/// Places its widgets side by side, each in its own width, and goes on in another line where they do not fit:
/// what is one line in one language may take two in the next.
class FlowLayout : public QLayout {
    Q_OBJECT

public:
    explicit FlowLayout(QWidget *parent = nullptr);
    ~FlowLayout() override;

    void addItem(QLayoutItem *item) override;
    /// Adds what is to stay together in one line.
    void addLayout(QLayout *layout);
    int count() const override { return static_cast<int>(m_items.size()); }
    QLayoutItem *itemAt(int index) const override;
    QLayoutItem *takeAt(int index) override;

    Qt::Orientations expandingDirections() const override { return {}; }
    bool hasHeightForWidth() const override { return true; }
    int heightForWidth(int width) const override;
    /// All in one line.
    QSize sizeHint() const override;
    /// As narrow as the widest.
    QSize minimumSize() const override;
    void setGeometry(const QRect &rect) override;

private:
    /// Goes through the lines that there are in a place, and returns the height that they take.
    template <typename Place>
    int goThrough(const QRect &rect, Place place) const;

    std::vector<std::unique_ptr<QLayoutItem>> m_items;
};
