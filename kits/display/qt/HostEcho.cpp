// SPDX-License-Identifier: MIT
// Finds out when a window manager has answered all that it was asked. Display thread only.
#include "display/qt/HostEcho.h"

namespace BPrivate {

namespace {

const QSize kSizes[] = {{64, 64}, {128, 128}};
// Milliseconds. A window manager that ended owes its answers forever.
const int kPatience = 10000;

} // namespace


HostEcho::HostEcho()
{
	setGeometry(QRect(QPoint(0, 0), kSizes[0]));
	create();
	fTimer.setSingleShot(true);
	fTimer.callOnTimeout(this, [this] { Answered(); });
}


void
HostEcho::WhenAnswered(QObject* owner, std::function<void()> then)
{
	fWaiting.push_back({owner, std::move(then)});
	if (fAsked.empty())
		Ask();
}


void
HostEcho::Ask()
{
	fAsked.swap(fWaiting);
	resize(size() == kSizes[0] ? kSizes[1] : kSizes[0]);
	fTimer.start(kPatience);
}


void
HostEcho::resizeEvent(QResizeEvent*)
{
	// Qt leaves out what is outdated by a later report, so that one may still be in its queue.
	if (!fAsked.empty())
		fTimer.start(0);
}


void
HostEcho::Answered()
{
	std::vector<Question> answered;
	answered.swap(fAsked);
	if (!fWaiting.empty())
		Ask();
	for (const Question& question : answered) {
		if (question.owner != nullptr)
			question.then();
	}
}

} // namespace BPrivate
