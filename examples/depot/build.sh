#!/usr/bin/env bash
# SPDX-License-Identifier: Apache-2.0
# Builds and runs the programs of this folder with an installed zelvo.
set -eu

mkdir -p bundle
genrb -e UTF-8 -d bundle root.txt de.txt
cc -std=c11 -o depot depot.c $(pkg-config --cflags --libs zelvo)
./depot
echo log/*
tail -qn 1 log/depot_??.log

rm -r log # the same in C++, with files of its own
c++ -std=c++17 -o depot_cpp depot.cpp $(pkg-config --cflags --libs zelvo)
./depot_cpp
echo log/*
tail -qn 1 log/depot_??.log
