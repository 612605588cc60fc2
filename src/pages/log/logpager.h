#pragma once

#include <QWidget>

class QComboBox;
class QLabel;
class QToolButton;

/// The bar below a table that is shown page by page.
class LogPager : public QWidget {
    Q_OBJECT

public:
    explicit LogPager(QWidget *parent = nullptr);

    /// The number of rows that there are to turn over; leads to the first page.
    void setRowCount(int rows);
    /// Leads to the page with the row, without telling so.
    void showRow(int row);
    int pageSize() const { return m_pageSize; }
    /// The first row of the present page.
    int firstRow() const { return m_page * m_pageSize; }

signals:
    /// Another page, or another number of rows on it.
    void pageChanged();
    void limitChosen(const QString &limit);

public slots:
    /// limit: the number of rows on a page. Leads to the page with the row.
    void updateLimit(const QString &limit, int row);

private:
    QToolButton *addButton(const char *name, const QString &icon, const QString &text,
                           void (LogPager::*slot)());
    void showPage();
    int pageCount() const;
    void goTo(int page);
    void goFirst() { goTo(0); }
    void goPrevious() { goTo(m_page - 1); }
    void goNext() { goTo(m_page + 1); }
    void goLast() { goTo(pageCount() - 1); }

    QComboBox *m_limit;
    QLabel *m_label;
    QToolButton *m_first = nullptr;
    QToolButton *m_previous = nullptr;
    QToolButton *m_next = nullptr;
    QToolButton *m_last = nullptr;
    int m_rows = 0;
    int m_pageSize = 0;
    int m_page = 0;
};
