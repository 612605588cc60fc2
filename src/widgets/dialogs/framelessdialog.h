#pragma once

#include <QDialog>
#include <QElapsedTimer>
#include <QTimer>

#include <memory>

class QLabel;
class QToolButton;
class QVBoxLayout;

/// A dialog in the program's own frame: title area with a close cross, below it the content of a form.
///
/// Its parts carry the object names "dialogWindow", "dialogFrame", "dialogDragger", "dialogTitleLabel" and
/// "dialogCloseButton". The dialog's own object name is that of its class, under which its beginning and its
/// end are logged.
class FramelessDialog : public QDialog {
    Q_OBJECT

public:
    explicit FramelessDialog(QWidget *parent = nullptr);
    ~FramelessDialog() override;

    /// The widget that a form's setupUi fills.
    QWidget *content() const { return m_content; }

    /// Takes the close cross away where the dialog must be answered.
    void setClosable(bool closable);

    /// Puts the dialog over the middle of its parent's window, unless the user has dragged it elsewhere.
    void centreOverParent();

    void setVisible(bool visible) override;

protected:
    void keyPressEvent(QKeyEvent *event) override;
    bool event(QEvent *event) override;
    void moveEvent(QMoveEvent *event) override;

    /// Right before it is shown: sets its size and its place.
    virtual void prepareToShow();
    /// Where the dialog stands with a size as long as the user has not dragged it: over the middle of its
    /// parent's window.
    virtual QRect preferredPlace(const QSize &size) const;

private:
    void fitContent();
    void correctPlace();
    void startPositionChecks();
    void checkNativePosition();

    QLabel *m_title;
    QToolButton *m_close;
    QWidget *m_content;
    bool m_closable = true;
    bool m_dragged = false;
    QElapsedTimer m_sinceShown;
    int m_corrections = 0; ///< how many are left for this showing
    QTimer m_positionTimer;
    int m_positionChecks = 0; ///< how many are left after the last change of the geometry
};

/// The parts of a form, set up in a widget: for members that need them before the constructor's body.
template <typename Form>
std::unique_ptr<Form> formIn(QWidget *content) {
    auto form = std::make_unique<Form>();
    form->setupUi(content);
    return form;
}
