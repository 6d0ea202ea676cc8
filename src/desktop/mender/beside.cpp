#include "desktop/mender/beside.h"

#include <QEventLoop>
#include <QThread>

#include <exception>
#include <memory>

namespace kindrel::desktop {

void run_beside(const std::function<void()>& work)
{
    std::exception_ptr failure;
    const std::unique_ptr<QThread> thread(QThread::create([&] {
        try {
            work();
        } catch (...) {
            failure = std::current_exception();
        }
    }));
    QEventLoop until_done;
    QObject::connect(thread.get(), &QThread::finished, &until_done, &QEventLoop::quit);
    thread->start();
    until_done.exec();
    thread->wait();
    if (failure)
        std::rethrow_exception(failure);
}

} // namespace kindrel::desktop
