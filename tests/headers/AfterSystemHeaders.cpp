// SPDX-License-Identifier: MIT
// The system's headers come first and all of them: a name of ours that is a macro or a reserved
// name of theirs is met here.

#include <bits/stdc++.h>
#include <ctype.h>
#include <fcntl.h>
#include <limits.h>
#include <math.h>
#include <pthread.h>
#include <stdio.h>
#include <stdlib.h>
#include <string.h>
#include <sys/stat.h>
#include <sys/types.h>
#include <time.h>
#include <unistd.h>

#include "brindle/brindle.h"
