#pragma once

#include <context/fullobjectloader.h>

#include <QObject>
#include <QString>

#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace vexa {

class BaseObject;
class CommandDispatcher;
class CorvidModel;
class DirEntry;
class ErrorInfo;
class QCJob;

// Everything one comparison page needs of a job, resolved from the store.
struct LoadedJob
{
    std::shared_ptr<QCJob> job;
    std::vector<std::shared_ptr<BaseObject>> objects; // the job and everything it refers to
};

// The host's connection to its object store: opens (and on first use fills) the
// store file through the command dispatcher, lists the QC jobs and loads one job
// with every object it refers to. All answers arrive on the GUI thread.
class StoreSession : public QObject
{
    Q_OBJECT
public:
    explicit StoreSession(QObject *parent = nullptr);
    ~StoreSession() override;

    // The embedded store in the user's data folder.
    static QString defaultStorePath();

    // Connects to the store file, creating it with the sample data when it does not exist
    // or is empty. Answers with sgOpened or sgError.
    void open(const QString &storePath);
    QString storePath() const { return m_storePath; }
    CorvidModel *corvidModel() const { return m_corvidModel; }
    CommandDispatcher *dispatcher() const;

    // Lists the QC jobs of the "QC Jobs" folder: sgJobsListed.
    void listJobs();
    // Loads a job with its template, standard, trials and tolerance sets: sgJobLoaded.
    void loadJob(const std::shared_ptr<DirEntry> &entry);
    // Loads the formulas and recipe trials of the "Formulas" folder with their colorants:
    // sgFormulasLoaded (the folder's objects first, in its order).
    void loadFormulas();

Q_SIGNALS:
    void sgOpened();
    void sgJobsListed(std::vector<std::shared_ptr<vexa::DirEntry>> entries);
    void sgJobLoaded(vexa::LoadedJob job);
    void sgFormulasLoaded(std::vector<std::shared_ptr<vexa::BaseObject>> objects);
    // One line for a message box.
    void sgError(const QString &message);
    void sgBusy(const QString &task, bool busy);

private:
    // Finds the top-level folder of that name and answers with its id (empty when missing).
    void findFolder(const QString &name, std::function<void(const QString &)> found);
    void ensureContents();
    void reportError(const QString &operation, const std::shared_ptr<ErrorInfo> &error);

    CorvidModel *m_corvidModel; // Child.
    QString m_storePath;
    std::string m_dispatcherId;
};

} // namespace vexa

Q_DECLARE_METATYPE(vexa::LoadedJob)
Q_DECLARE_METATYPE(std::vector<std::shared_ptr<vexa::DirEntry>>)
