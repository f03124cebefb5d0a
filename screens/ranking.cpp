#include "screens/ranking.h"

void RankingFrame() {}
