// SPDX-License-Identifier: MIT
// Permissions do not bind the administrator: being somebody else for a while.

#ifndef ORDINARY_USER_H
#define ORDINARY_USER_H

#include <unistd.h>

/// Where the program runs as the administrator, it has the rights of nobody until the end.
class OrdinaryUser {
public:
	OrdinaryUser()
		: fWasRoot(geteuid() == 0)
	{
		if (fWasRoot && seteuid(65534) != 0)
			_exit(1);
	}
	~OrdinaryUser()
	{
		if (fWasRoot && seteuid(0) != 0)
			_exit(1);
	}

private:
	bool fWasRoot;
};

#endif
