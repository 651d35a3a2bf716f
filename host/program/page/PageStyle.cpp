#include "host/program/page/PageStyle.h"

const char* const PageStyle = R"css(
:root { color-scheme: light dark;
  --back: #f3f4f6; --card: #ffffff; --ink: #1c2330; --quiet: #566072; --line: #d5d9e0;
  --accent: #1f5fbf; --good: #1a6b3c; --good-back: #e0f3e7; --warn: #7a4d00; --warn-back: #fdf0d3;
  --bad: #a3201d; --bad-back: #fce4e2; }
@media (prefers-color-scheme: dark) { :root {
  --back: #14171c; --card: #1d2129; --ink: #e7eaf0; --quiet: #a3adbd; --line: #363d49;
  --accent: #8ab6ff; --good: #86dba6; --good-back: #173424; --warn: #f2c675; --warn-back: #3a2c10;
  --bad: #ff9d96; --bad-back: #431d1c; } }
* { box-sizing: border-box; }
body { margin: 0 auto; max-width: 70rem; padding: 1rem; background: var(--back); color: var(--ink);
  font: 1rem/1.5 system-ui, sans-serif; overflow-wrap: anywhere; }
h1, h2, h3, p, dl, dd, ul, ol { margin: 0; padding: 0; }
ul, ol { list-style: none; }
h1 { font-size: 1.4rem; }
h2 { font-size: 1.1rem; margin-right: auto; }
h3 { font-size: 1rem; }
section { margin-top: 1.5rem; outline-offset: .4rem; }
section:empty { display: none; }
.bar { display: flex; flex-wrap: wrap; gap: .5rem 1rem; align-items: center; margin-bottom: .6rem; }
.card { background: var(--card); border: 1px solid var(--line); border-radius: .5rem;
  padding: .8rem 1rem; }
.cards { display: grid; gap: .8rem; grid-template-columns: repeat(auto-fill, minmax(min(100%, 23rem), 1fr)); }
.list { display: grid; gap: .6rem; }
.quiet { color: var(--quiet); font-size: .9rem; }
.badge { border-radius: 1rem; padding: 0 .6rem; font-size: .85rem; font-weight: 600; }
.notice { border-radius: .5rem; padding: .6rem 1rem; margin-bottom: .8rem; font-weight: 600; }
.notice li + li { margin-top: .2rem; }
.good { color: var(--good); background: var(--good-back); }
.warn { color: var(--warn); background: var(--warn-back); }
.bad { color: var(--bad); background: var(--bad-back); }
.reason { font-weight: 600; margin-top: .3rem; }
.card > .bar:last-child { margin-bottom: 0; }
.paths { display: grid; grid-template-columns: max-content 1fr; gap: 0 .8rem; font-size: .9rem; }
.paths dt, .figures dt { color: var(--quiet); }
.figures { display: grid; grid-template-columns: repeat(auto-fit, minmax(6.5rem, 1fr)); gap: .5rem .8rem;
  margin: .7rem 0; }
.figures div { display: flex; flex-direction: column-reverse; justify-content: flex-end; }
.figures dt { font-size: .8rem; line-height: 1.3; }
.figures dd { font-size: 1.15rem; font-weight: 600; font-variant-numeric: tabular-nums; }
.figures .bad { background: none; }
.sums { margin: 0; flex: 1 1 16rem; grid-template-columns: repeat(auto-fit, minmax(4.5rem, 8rem)); }
.sums dd { font-size: 1.6rem; line-height: 1.3; }
.row { display: flex; flex-wrap: wrap; gap: .3rem 1rem; align-items: baseline; justify-content: space-between; }
.row > :first-child { flex: 1 1 14rem; min-width: 0; }
time { white-space: nowrap; }
#away:not([hidden]) { position: sticky; top: .5rem; }
progress { width: 100%; height: .6rem; accent-color: var(--accent); display: block; margin-top: .4rem; }
button { font: inherit; color: var(--ink); background: var(--card); border: 1px solid var(--quiet);
  border-radius: .4rem; padding: .3rem .9rem; min-height: 2.2rem; cursor: pointer; }
button:hover { border-color: var(--accent); color: var(--accent); }
a { color: var(--accent); }
:focus-visible { outline: 3px solid var(--accent); outline-offset: 2px; }
footer { margin-top: 2rem; padding-top: .8rem; border-top: 1px solid var(--line); color: var(--quiet);
  font-size: .9rem; display: flex; flex-wrap: wrap; gap: .5rem 2rem; justify-content: space-between; }
footer ul { display: flex; flex-wrap: wrap; gap: .3rem 1rem; }
[aria-current] { color: inherit; font-weight: 600; text-decoration: none; }
)css";

const char* const PageScript = R"js(
(function () {
  'use strict';
  var away = document.getElementById('away'), isBusy = false;
  function isMarked(part) {
    var marked = getSelection();
    return !marked.isCollapsed && marked.containsNode(part, true);
  }
  function replace(part) {
    var old = document.getElementById(part.id);
    if (old.innerHTML === part.innerHTML || isMarked(old)) return;
    var hadFocus = old.contains(document.activeElement) && document.activeElement;
    old.innerHTML = part.innerHTML;
    if (hadFocus)
      (document.getElementById(hadFocus.id) || old).focus({preventScroll: true});
  }
  function refresh() {
    if (document.hidden || isBusy) return;
    isBusy = true;
    fetch(location.href, {cache: 'no-store'}).then(function (answer) {
      return answer.ok ? answer.text() : Promise.reject();
    }).then(function (text) {
      var main = text.slice(text.indexOf('<main>'), text.indexOf('</main>'));
      new DOMParser().parseFromString(main, 'text/html').querySelectorAll('[data-part]')
        .forEach(replace);
      away.hidden = true;
    }).catch(function () { away.hidden = false; }).then(function () { isBusy = false; });
  }
  setInterval(refresh, 3000);
  document.addEventListener('visibilitychange', refresh);
})();
)js";
