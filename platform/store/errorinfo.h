#pragma once

#include <store/store_export.h>

#include <QMetaType>
#include <QString>
#include <QStringList>

#include <memory>

namespace vexa {

// The reasons a store request can fail. Each failure kind has a code of its
// own so that callers (and the user reading "... (2007)") can tell them apart.
enum class CorvidErrorCode : int {
    NoError = 0,
    Unknown = 1,

    // Connection and storage.
    NotConnected = 1001,
    DatabaseError = 1002,
    SerializationError = 1003,
    InvalidRequest = 1004,
    NotSupported = 1005,

    // Requests that name something that is not there or not allowed.
    ObjectNotFound = 2001,
    DirEntryNotFound = 2002,
    UnknownType = 2003,
    FolderNotFound = 2004,
    NotAFolder = 2005,
    MoveIntoOwnSubfolder = 2006,
    FolderNotEmpty = 2007,
    VersionConflict = 2008,
    DuplicateId = 2009,
    TypeMismatch = 2010,
    RootFolderProtected = 2011,
    ImageNotAvailable = 2012,
};

// A failure reported by a store or server: a message for the user, a code and
// a message for the log.
class VEXA_STORE_EXPORT ErrorInfo
{
public:
    ErrorInfo() = default;
    ErrorInfo(const QString &message, CorvidErrorCode code, const QString &internalMessage = QString());

    // Makes an error whose message and internal message have %1, %2, ...
    // replaced by the arguments in order.
    static std::shared_ptr<ErrorInfo> create(const QString &message, CorvidErrorCode code,
                                             const QString &internalMessage,
                                             const QStringList &arguments = QStringList());
    static std::shared_ptr<ErrorInfo> create(const QString &message, int code, const QString &internalMessage,
                                             const QStringList &arguments = QStringList());

    QString message() const { return m_message; }
    void setMessage(const QString &message) { m_message = message; }
    CorvidErrorCode errorCode() const { return m_errorCode; }
    void setErrorCode(CorvidErrorCode code) { m_errorCode = code; }
    QString internalMessage() const { return m_internalMessage; }
    void setInternalMessage(const QString &message) { m_internalMessage = message; }

    bool isError() const { return m_errorCode != CorvidErrorCode::NoError; }
    // "message (code)", the form used in logs.
    QString toString() const;

    // Fills *target (when given) and returns false, for "return fail(...)" in store code.
    static bool fail(ErrorInfo *target, CorvidErrorCode code, const QString &message,
                     const QString &internalMessage = QString());

private:
    QString m_message;
    CorvidErrorCode m_errorCode = CorvidErrorCode::NoError;
    QString m_internalMessage;
};

// Replaces %1, %2, ... in text by the arguments; %10 is not mistaken for %1.
VEXA_STORE_EXPORT QString substituteArguments(const QString &text, const QStringList &arguments);

} // namespace vexa

Q_DECLARE_METATYPE(vexa::ErrorInfo)
Q_DECLARE_METATYPE(std::shared_ptr<vexa::ErrorInfo>)
