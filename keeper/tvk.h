// The keeper's tool: a console program of one verb.
#pragma once

// Does what the command line asks for. The exit status: 0 all well, 1 something was refused, 2 wrong use.
int Tvk();
