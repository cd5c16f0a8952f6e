#include "daemon/lifecycle.h"

int main() { return KVDMain(); }
