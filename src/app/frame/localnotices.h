#pragma once

#include "platform/files/storetrouble.h"

#include <QObject>

class NoticeCard;

/// Tells the user what is wrong with the files of the program, and what is missing among them.
class LocalNotices : public QObject {
    Q_OBJECT

public:
    explicit LocalNotices(QWidget *frame);

    /// Says once and for all that there is no key of the user's own.
    void tellOfMissingKey();

private:
    void tell(const StoreTrouble::Report &report);

    NoticeCard *m_card;
};
