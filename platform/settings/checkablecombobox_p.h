#pragma once

//
//  W A R N I N G
//  -------------
// Used inside the settings editor only; not installed, not part of the API.
//

#include <QComboBox>

class QStandardItemModel;

// A combo box of check-box items for choosing several values. The closed box
// shows a summary text; clicks in the open list toggle items and keep it open.
class CheckableComboBox : public QComboBox
{
    Q_OBJECT
public:
    explicit CheckableComboBox(QWidget *parent = nullptr);
    ~CheckableComboBox() override;

    void addCheckableItem(const QString &text, const QString &value, bool checked);
    bool isItemChecked(int index) const;
    // Changes a check state without emitting sgItemCheckToggled.
    void setItemChecked(int index, bool checked);
    QStringList checkedValues() const;

    QString summaryText() const { return m_summaryText; }
    void setSummaryText(const QString &text);

Q_SIGNALS:
    void sgItemCheckToggled(int index, bool checked);

protected:
    void paintEvent(QPaintEvent *event) override;
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    QStandardItemModel *m_model; // Owned by the combo box.
    QString m_summaryText;
    bool m_silent = false;
};
