#pragma once

#include "devices/operations/operationtargets.h"
#include "widgets/dialogs/framelessdialog.h"
#include "widgets/dialogs/warningline.h"

class QLabel;
class QPushButton;
class QVBoxLayout;
class TargetSummary;

/// A dialog that asks for what an operation on devices needs: its fields, below them the devices, then the
/// buttons "Cancel" and the one that begins the operation, which stays off while no device is ticked.
class OperationDialog : public FramelessDialog {
    Q_OBJECT

public:
    ~OperationDialog() override;

protected:
    OperationDialog(const QString &title, QWidget *parent);

    /// Adds the devices and the buttons below the fields: the last thing that a constructor does, so that the
    /// keyboard's way leads from top to bottom.
    void finish(OperationTargets::List targets, OperationTargets::Need need, const QString &acceptText,
                const char *acceptName);
    /// The same where the devices have been added already.
    void finish(const QString &acceptText, const char *acceptName);
    /// Adds the devices below the parts there are, for a dialog that has more parts after them.
    void addTargets(OperationTargets::List targets, OperationTargets::Need need);
    /// Other devices in place of those that were added, all of them ticked.
    void replaceTargets(OperationTargets::List targets);

    /// Adds a part below those there are.
    void addPart(QWidget *part);
    /// Adds a field with its caption above it and a line below it for what is wrong; returns that line.
    QLabel *addField(const QString &caption, QWidget *field, const char *warningName);

    QWidget *body() const { return m_body; }
    const TargetSummary &targets() const { return *m_targets; }
    TargetSummary &targets() { return *m_targets; }
    QPushButton *acceptButton() const { return m_accept; }

    /// What speaks against some of the devices beside their states; replaces what an earlier call gave.
    void setWarnings(std::vector<TargetWarning> warnings);
    /// What is wrong with the whole, beside an icon; empty for nothing.
    void setComplaint(const QString &text, const QString &icon = WarningLine::defaultIcon) {
        m_complaint.setText(text, icon);
    }

    /// Says something quietly beside the buttons; once the dialog is finished.
    void setFootNote(const QString &text);

    /// The accept button was pressed, with devices ticked.
    virtual void apply() = 0;
    /// Whether it can be pressed at all, as far as the fields go; asked when devices are ticked or unticked.
    virtual bool isComplete() const { return true; }
    void updateAccept();

    /// Text of a given kind of label, plain whatever it says.
    QLabel *label(const QString &text, const char *role) const;

private:
    QWidget *buildFooter(const QString &acceptText, const char *acceptName);

    QVBoxLayout *m_layout;
    QWidget *m_body;
    QVBoxLayout *m_parts;
    TargetSummary *m_targets = nullptr;
    QPushButton *m_accept = nullptr;
    QLabel *m_footNote;
    WarningLine m_complaint;
    OperationTargets::Need m_need = OperationTargets::Need::Connection;
    std::vector<TargetWarning> m_given; ///< what the devices' states speak against
};
