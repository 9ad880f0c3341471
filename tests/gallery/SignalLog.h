#pragma once

#include <QByteArray>
#include <QMetaMethod>
#include <QPointer>
#include <QStringList>
#include <QWidget>
#include <private/qmetaobject_p.h>
#include <private/qobject_p.h>
#include <utility>

// Records every signal that widgets emit, whether it is connected or not.
class SignalLog
{
public:
    SignalLog()
    {
        s_log = this;
        static QSignalSpyCallbackSet callbacks{&SignalLog::begin, nullptr, nullptr, nullptr};
        qt_register_signal_spy_callbacks(&callbacks);
    }
    ~SignalLog()
    {
        qt_register_signal_spy_callbacks(nullptr);
        s_log = nullptr;
    }
    SignalLog(const SignalLog&) = delete;
    SignalLog& operator=(const SignalLog&) = delete;

    // Returns the names of the signals since the last call, each once: those of this widget and its
    // ancestors, or of all widgets for null.
    QStringList take(const QWidget* of = nullptr)
    {
        QStringList names;
        for (const Entry& entry : std::exchange(m_entries, {})) {
            const bool concerns =
                of == nullptr || (entry.sender && entry.sender->isAncestorOf(of)) || entry.sender == of;
            if (concerns && !names.contains(entry.name))
                names.append(entry.name);
        }
        return names;
    }

private:
    struct Entry {
        QPointer<QWidget> sender;
        QString name;
    };

    static void begin(QObject* sender, int index, void**)
    {
        if (s_log == nullptr || !sender->isWidgetType())
            return;
        const QMetaMethod method = QMetaObjectPrivate::signal(sender->metaObject(), index);
        if (method.name() == "destroyed")
            return;
        s_log->m_entries.append({static_cast<QWidget*>(sender), QString::fromLatin1(method.name())});
    }

    static inline SignalLog* s_log = nullptr;
    QList<Entry> m_entries;
};
