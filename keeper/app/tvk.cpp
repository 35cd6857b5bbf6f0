#include "keeper/tvk.h"

int main() { return Tvk(); }
