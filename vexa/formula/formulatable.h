#pragma once

#include <vexa/vexa_export.h>

#include <QTableView>

namespace vexa {

// The table view of a formula: Ctrl+C puts every cell's shown text on the clipboard, a tab
// between cells and a line feed after each row, in the order the view shows them.
class VEXA_EXPORT FormulaTable : public QTableView
{
    Q_OBJECT
public:
    explicit FormulaTable(QWidget *parent = nullptr);

    // The text Ctrl+C copies.
    QString clipboardText() const;
    void copyDataToClipboard();

protected:
    void keyPressEvent(QKeyEvent *event) override;
};

} // namespace vexa
