/* bench.mjs natively: nanoseconds of processor time for a pair, and the sum of the differences. */
#include <stdio.h>
#include <time.h>
#include <vantrel.h>

#define PAIRS 100000
static CIELABCOORD first[PAIRS], second[PAIRS];

int main(void)
{
    double sum = 0;
    for (int i = 0; i < PAIRS; ++i) {
        first[i] = (CIELABCOORD){i * 37 % 101, i * 53 % 161 - 80, i * 71 % 163 - 81};
        second[i] = (CIELABCOORD){i * 41 % 103, i * 59 % 157 - 78, i * 67 % 167 - 83};
    }
    const clock_t start = clock();
    for (int i = 0; i < PAIRS; ++i) {
        double difference = 0;
        LabToDE2000(&first[i], &second[i], 1, 1, &difference);
        sum += difference;
    }
    printf("%.1f %.17g\n", 1e9 * (double)(clock() - start) / CLOCKS_PER_SEC / PAIRS, sum);
}
