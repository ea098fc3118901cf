// SPDX-License-Identifier: MIT
// Finds out when a window manager has answered all that it was asked. Display thread only.
#ifndef DISPLAY_QT_HOST_ECHO_H
#define DISPLAY_QT_HOST_ECHO_H

#include <functional>
#include <utility>
#include <vector>

#include <QPointer>
#include <QTimer>
#include <QWindow>

namespace BPrivate {

/// A window of an X server that is never shown. A window manager is asked about its size as about those of all others, in
/// turn, and lets a hidden window have what it wants: once it has, all that was asked before is answered, too.
class HostEcho : public QWindow {
public:
	HostEcho();

	/// Calls \a then when the host has answered what it was asked by now and all that it has told meanwhile was handled,
	/// unless \a owner has gone. Never before this call returns.
	void WhenAnswered(QObject* owner, std::function<void()> then);

protected:
	void resizeEvent(QResizeEvent* event) override;

private:
	struct Question {
		QPointer<QObject> owner;
		std::function<void()> then;
	};

	void Ask();
	void Answered();

	/// Those that the request under way is for, and those that came after it was made.
	std::vector<Question> fAsked;
	std::vector<Question> fWaiting;
	/// When this ends, the host has answered, or is not going to.
	QTimer fTimer;
};

} // namespace BPrivate

#endif // DISPLAY_QT_HOST_ECHO_H
