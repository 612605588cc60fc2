#include "app/frame/localnotices.h"

#include "app/frame/noticecard.h"
#include "platform/files/apppaths.h"
#include "store/localstore.h"
#include "store/storewriter.h"

#include <QCoreApplication>
#include <QDir>
#include <QFileInfo>
#include <QPointer>

LocalNotices::LocalNotices(QWidget *frame) : QObject(frame), m_card(new NoticeCard(frame)) {
    StoreTrouble::setReceiver([notices = QPointer(this)](const StoreTrouble::Report &report) {
        // Stores are used on any thread, and until the very end.
        if (!qApp)
            return;
        QMetaObject::invokeMethod(
            qApp,
            [notices, report] {
                if (notices)
                    notices->tell(report);
            },
            Qt::QueuedConnection);
    });
}

void LocalNotices::tell(const StoreTrouble::Report &report) {
    const QString file = QDir::toNativeSeparators(report.file);
    const QString page = QStringLiteral("troubleshooting.html");
    switch (report.kind) {
    case StoreTrouble::Kind::Repaired:
        return m_card->add(
            tr("The file %1 was damaged. What could be read of it was kept, and the damaged file "
               "is now called %2. Saved servers and settings may be missing.")
                .arg(file, QFileInfo(report.keptAs).fileName()),
            page);
    case StoreTrouble::Kind::Unrepaired:
        return m_card->add(
            tr("The file %1 is damaged and could not be repaired. Saved servers and settings may "
               "be missing, and changes of them are not kept.")
                .arg(file),
            page);
    case StoreTrouble::Kind::Unreadable:
        return m_card->add(
            tr("The file %1 cannot be read. Saved servers and settings may be missing.").arg(file), page);
    case StoreTrouble::Kind::Unwritable:
        return m_card->add(
            tr("The file %1 cannot be written; the disk may be full. What is saved there is used, "
               "but changes are not kept.")
                .arg(file),
            page);
    }
}

void LocalNotices::tellOfMissingKey() {
    CLocalStore &store = CLocalStore::instance();
    if (QFileInfo::exists(AppPaths::keyFile()) || store.isMissingKeyTold())
        return;
    StoreWriter::post([] { CLocalStore::instance().setMissingKeyTold(true); });
    m_card->add(
        tr("There is no key file of your own. Passwords are ciphered with a key that every copy of this "
           "program has. The user guide says what that means, and how a key file is made."),
        QStringLiteral("security.html"));
}
