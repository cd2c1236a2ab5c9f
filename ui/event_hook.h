#pragma once

#include <QEvent>
#include <QObject>
#include <functional>

// Hands every event of `target` to `handler`, which returns true for an event it has taken so
// that it goes no further. The hook lives as long as `target`.
void OnEvents(QObject *target, std::function<bool(QEvent *)> handler);
