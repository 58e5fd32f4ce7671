#!/usr/bin/env bash
# Writes a synthetic estate of N plausible sub-compartments over all 22 models
# as CSV on stdout, for the estate benchmark and for trying the estate command
# at scale. The same N and SEED give the same file.
# Usage: scripts/generate-estate.sh N [SEED] > estate.csv
#
# Stands are 12 to 30 years old, with a top height from a site index between
# 10 and 22 m, a stocking that falls with age and a basal area that rises with
# it. Thinned models get a regime of their own (the first thinning the year
# after the present, or at 20, then every 5 years); un-thinned models none.
# About one row in a thousand is spoilt (an empty age, a model 22, a stocking
# of 40) so that the errors table is exercised as well.
set -euo pipefail

if [[ $# -lt 1 || ! "$1" =~ ^[0-9]+$ ]]; then
    echo "usage: $0 N [SEED] > estate.csv" >&2
    exit 2
fi

awk -v rows="$1" -v seed="${2:-1}" 'BEGIN {
    srand(seed)
    # Models without a thinning response.
    split("1 3 5 7 9 11 13 15 17 18 20", names, " ")
    for (i in names) unthinned[names[i]] = 1
    split("Glenmore Ardnish Kilbride Dunmore Craigend", blocks, " ")
    print "id,block,model,age,stocking,top_height,basal_area,area_ha,thin_from,thin_every,thin_volume,note"
    for (r = 1; r <= rows; ++r) {
        model = int(rand() * 22)
        age = 12 + int(rand() * 19)
        site = 10 + rand() * 12
        height = site * (age / 30) ^ 0.9
        if (height < 5.2) height = 5.2 + rand()
        stocking = int(2800 - 45 * (age - 12) - rand() * 400)
        basal = 12 + (age - 12) * 1.1 + rand() * 8
        area = 0.5 + rand() * 14.5
        if (model in unthinned) {
            regime = "0,,"
        } else {
            first = age < 20 ? 20 : age + 1
            regime = first ",5," (30 + int(rand() * 3) * 5)
        }
        spoilt = rand()
        if (spoilt < 0.0003) age = ""
        else if (spoilt < 0.0006) model = 22
        else if (spoilt < 0.001) stocking = 40
        printf "SC%07d,%s,%d,%s,%d,%.1f,%.2f,%.2f,%s,%s\n", r, blocks[1 + int(rand() * 5)],
               model, age, stocking, height, basal, area, regime, (r % 50 == 0 ? "\"fenced, deer\"" : "")
    }
}'
