#pragma once

#include <vexa/vexa_export.h>

#include <QObject>
#include <QString>

#include <memory>
#include <string>

class QPrinter;
class QSortFilterProxyModel;
class QTextDocument;
class QWidget;

namespace vexa {

// Prints the rows of a sorted and filtered table as an HTML table: up to three bold
// captions, a header row, the rows in the proxy's order (numbers right-aligned from the
// third column on) and an optional total line. Texts are inserted as they are.
class VEXA_EXPORT TablePrinter : public QObject
{
    Q_OBJECT
public:
    explicit TablePrinter(std::shared_ptr<QSortFilterProxyModel> model, QObject *parent = nullptr);
    ~TablePrinter() override;

    void setTitle(const std::string &title1, const std::string &title2, const std::string &title3);
    // Empty means no total line.
    void setTotal(const std::string &total);

    // The document text built from the model's current state. Every text (titles, headers,
    // cells, total) is escaped: a name such as "<b>A & B" prints as it is written.
    QString html() const;
    // Fills document() from the model's current state (what print and preview do first).
    void buildDocument();
    QTextDocument *document() const { return m_document; }

    // Shows a print dialog (through DialogRunner); prints only when it is accepted.
    // True when something was printed.
    bool print(QWidget *parent = nullptr);
    // Shows a print preview whose pages are painted by printDocument().
    void printPreview(QWidget *parent = nullptr);
    // Writes the table as a PDF file without asking; false when the file cannot be written.
    bool printToPdf(const QString &fileName);

public Q_SLOTS:
    // Builds the document afresh and prints it to the printer.
    void printDocument(QPrinter *printer);

private:
    std::string m_title1;
    std::string m_title2;
    std::string m_title3;
    std::string m_total;
    std::shared_ptr<QSortFilterProxyModel> m_model;
    QTextDocument *m_document = nullptr; // Child object.
};

} // namespace vexa
