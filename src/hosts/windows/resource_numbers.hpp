// The numbers of what the program has in its resources; the resource compiler reads this, too.
#define QUABBLE_ICON 1
