// Delivery by Qt's signals. They may be emitted on any thread; the receivers are called on that
// thread.

#include <QObject>

#include "benchmarks.h"
#include "delivery.h"

namespace bench
{

class QtSignals : public QObject
{
    Q_OBJECT

public:
    void Add(CountingListener& listener)
    {
        connect(this, &QtSignals::playStarted, [&listener] { listener.PlayStarted(); });
        connect(this, &QtSignals::currentTimePosition,
                [&listener](const bd::TimePosition& position) {
                    listener.CurrentTimePosition(position);
                });
        connect(this, &QtSignals::audioInfoChanged,
                [&listener](bool isPrimary, const bd::AudioInfoType& info) {
                    listener.AudioInfoChanged(isPrimary, info);
                });
    }

    void PlayStarted() { emit playStarted(); }
    void CurrentTimePosition(const bd::TimePosition& position)
    {
        emit currentTimePosition(position);
    }
    void AudioInfoChanged(bool isPrimary, const bd::AudioInfoType& info)
    {
        emit audioInfoChanged(isPrimary, info);
    }

signals:
    void playStarted();
    void currentTimePosition(const bd::TimePosition& position);
    void audioInfoChanged(bool isPrimary, bd::AudioInfoType info);
};

void RegisterQtDelivery()
{
    RegisterDelivery<QtSignals>(QtName);
}

} // namespace bench

#include "delivery_qt_bench.moc"
