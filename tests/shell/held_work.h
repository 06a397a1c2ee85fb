#pragma once

#include <pthread.h>
#include <unistd.h>

#include <QFile>
#include <csignal>

namespace gridbay::shell {

// Work beside the window, by the copies of this process that do it.

struct CopyToCome {
  int number = 0;  // 0 for none
  int signal = 0;
};
inline CopyToCome copyToCome;

// The n-th copy that is made from now on gets a signal before it does anything: SIGSTOP holds it, SIGKILL is
// a sudden end.
inline void signalCopy(int nth, int signal) {
  static const int isReady = pthread_atfork([] { --copyToCome.number; }, nullptr,
                                            [] {
                                              if (copyToCome.number == 0) raise(copyToCome.signal);
                                            });
  if (isReady == 0) copyToCome = {nth, signal};
}

// Lets all that is held go on.
inline void releaseCopies() {
  QFile children(QString("/proc/%1/task/%1/children").arg(getpid()));
  if (!children.open(QFile::ReadOnly)) return;
  for (const QByteArray& copy : children.readAll().split(' ')) {
    if (copy.toInt() > 0) kill(copy.toInt(), SIGCONT);
  }
}

}  // namespace gridbay::shell
