// SPDX-License-Identifier: MIT
// The entry points of the display module.
#include <cstdio>
#include <cstring>
#include <memory>
#include <string>

#include <QMessageLogContext>
#include <QString>
#include <QtGlobal>

#include "display/DisplayModule.h"
#include "display/qt/Platforms.h"
#include "display/qt/QtDisplay.h"

namespace {

using BPrivate::QtDisplay;

QtDisplay* sDisplay = nullptr;
std::string sReason;


/// What Qt has to say: errors go to standard error. A broken connection is a case of its own, since Qt
/// ends the program right after it has said so.
void
HandleQtMessage(QtMsgType type, const QMessageLogContext&, const QString& message)
{
	QByteArray text = message.toUtf8();
	bool isLost = text.contains("connection broke") || text.contains("connection experienced");
	if (isLost && sDisplay != nullptr && sDisplay->Thread().IsCurrent())
		sDisplay->Lost();

	bool isNoise = type == QtDebugMsg || type == QtInfoMsg
		|| text.startsWith("WARNING: QApplication was not created in the main() thread")
		|| text.startsWith("This plugin does not support")
		|| text.startsWith("QStandardPaths: XDG_RUNTIME_DIR not set");
	if (!isNoise)
		fprintf(stderr, "libbe: display: %s\n", text.constData());
}

} // namespace


extern "C" __attribute__((visibility("default"))) BPrivate::Display*
be_display_start(const char** reason)
{
	std::string platforms = BPrivate::ChoosePlatforms(&sReason);
	*reason = sReason.c_str();
	if (platforms.empty())
		return nullptr;

	qInstallMessageHandler(HandleQtMessage);
	auto display = std::make_unique<QtDisplay>(!BPrivate::HasWindowManager(platforms));
	sDisplay = display.get();
	bool isConnected = display->Start(platforms);
	BPrivate::PlatformsConnected();
	// Never deleted then: the program's threads may call it until the very end.
	if (isConnected)
		return display.release();

	sDisplay = nullptr;
	sReason = "Qt has no platform \"" + platforms + "\"";
	*reason = sReason.c_str();
	return nullptr;
}


extern "C" __attribute__((visibility("default"))) void
be_display_stop()
{
	if (sDisplay != nullptr)
		sDisplay->Stop();
}
