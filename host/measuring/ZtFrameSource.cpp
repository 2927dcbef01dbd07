// SPDX-License-Identifier: MIT
#include "measuring/ZtFrameSource.h"

ZtFrameSource::ZtFrameSource(QObject *parent)
    : QObject(parent)
{}

ZtFrameSource::~ZtFrameSource() = default;
