#include "ui/event_hook.h"

namespace {

class EventHook : public QObject {
public:
  EventHook(QObject *target, std::function<bool(QEvent *)> handler)
      : QObject(target), handler_(std::move(handler)) {}

protected:
  bool eventFilter(QObject *, QEvent *event) override { return handler_(event); }

private:
  std::function<bool(QEvent *)> handler_;
};

} // namespace

void OnEvents(QObject *target, std::function<bool(QEvent *)> handler) {
  target->installEventFilter(new EventHook(target, std::move(handler)));
}
