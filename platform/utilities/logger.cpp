#include "logger.h"

#include <QDebug>

QString logCategoryName(LogCategory category)
{
    switch (category) {
    case LogCategory::General:
        return QStringLiteral("General");
    case LogCategory::Colorimetry:
        return QStringLiteral("Colorimetry");
    case LogCategory::Store:
        return QStringLiteral("Store");
    case LogCategory::Settings:
        return QStringLiteral("Settings");
    case LogCategory::Ui:
        return QStringLiteral("Ui");
    }
    return QStringLiteral("Unknown");
}

LogInterface::~LogInterface() = default;

Logger &Logger::instance()
{
    static Logger logger;
    return logger;
}

void Logger::debug(LogCategory category, const QString &message)
{
    write(LogLevel::Debug, category, message);
}

void Logger::warning(LogCategory category, const QString &message)
{
    write(LogLevel::Warning, category, message);
}

void Logger::error(LogCategory category, const QString &message)
{
    write(LogLevel::Error, category, message);
}

void Logger::registerLogger(LogInterface *sink)
{
    if (!sink)
        return;
    std::lock_guard<std::mutex> lock(m_mutex);
    if (!m_sinks.contains(sink))
        m_sinks.append(sink);
}

void Logger::unregisterLogger(LogInterface *sink)
{
    std::lock_guard<std::mutex> lock(m_mutex);
    m_sinks.removeAll(sink);
}

void Logger::setAlwaysUseQtLog(bool on)
{
    std::lock_guard<std::mutex> lock(m_mutex);
    m_alwaysQt = on;
}

void Logger::write(LogLevel level, LogCategory category, const QString &message)
{
    std::lock_guard<std::mutex> lock(m_mutex);
    for (LogInterface *sink : qAsConst(m_sinks))
        sink->log(level, category, message);
    if (m_sinks.isEmpty() || m_alwaysQt) {
        const QString line = QStringLiteral("[%1] %2").arg(logCategoryName(category), message);
        if (level == LogLevel::Error)
            qCritical().noquote() << line;
        else if (level == LogLevel::Warning)
            qWarning().noquote() << line;
        else
            qDebug().noquote() << line;
    }
}

