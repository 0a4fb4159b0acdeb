// The page of `robotcfg serve`, compiled into the tool.
#pragma once

const char *servePageHtml();
const char *servePageCss();
const char *servePageScript();
