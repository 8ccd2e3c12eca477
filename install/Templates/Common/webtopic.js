// Loaded by every topic: ties it to the frame page of the web help (main.htm). A topic in a frame says which
// page it is, since a frame page on the disk can't look into its frame, and marks the words that were searched.
(function () {
  "use strict";
  // Only a browser has a frame page to offer; help viewers and editors show topics by themselves.
  if (!/^(file|https?):$/.test(location.protocol) || /QtWebEngine/.test(navigator.userAgent)) return;

  if (top === self) {
    // The script at the page's end goes to the frame page where no editing has been turned on. It knows
    // that state by the name "Inherit", browsers of today by "off".
    if (document.designMode === "off")
      Object.defineProperty(document, "designMode", { configurable: true, get: function () { return "Inherit"; } });
    return;
  }

  var tell = function (message) { parent.postMessage(message, "*"); };
  var shown = function () { tell({ tovimar: "page", href: location.href, title: document.title }); };
  document.addEventListener("DOMContentLoaded", function () { wrapPictures(); shown(); });
  addEventListener("hashchange", shown);
  addEventListener("pageshow", function (event) { if (event.persisted) shown(); });
  addEventListener("message", function (event) {
    var message = event.data;
    if (event.source === parent && message && message.tovimar === "mark" && Array.isArray(message.words)) mark(message.words);
  });
  addEventListener("keydown", function (event) {
    if (event.defaultPrevented || event.altKey || /^(INPUT|TEXTAREA|SELECT)$/.test(event.target.tagName)) return;
    var key = event.key === "/" || (event.ctrlKey && event.key.toLowerCase() === "k") ? "/" : event.key === "Escape" ? "Escape" : "";
    if (!key) return;
    tell({ tovimar: "key", key: key });
    if (key === "/") event.preventDefault();
  });

  // Pictures between the paragraphs of a control, too, scroll by themselves where the screen is narrow.
  function wrapPictures() {
    document.querySelectorAll("img[usemap]").forEach(function (picture) {
      if (picture.closest(".picture")) return;
      var box = document.createElement("div");
      box.className = "picture";
      picture.replaceWith(box);
      box.append(picture);
    });
  }

  // As the search page folds words.
  var plain = { "ß": "ss", "æ": "ae", "œ": "oe", "ø": "o", "ł": "l", "đ": "d", "ð": "d", "ħ": "h", "ı": "i", "þ": "th", "ς": "σ" };
  function fold(word) {
    return word.normalize("NFKD").toLowerCase().replace(/[\u0300-\u036f]/g, "").replace(/[ßæœøłđðħıþς]/g, function (c) { return plain[c]; });
  }
  var WORD = /[\u3040-\u30ff\u3400-\u9fff\uf900-\ufaff]|(?:(?![\u3040-\u30ff\u3400-\u9fff\uf900-\ufaff])[\p{L}\p{N}\p{M}])+/gu;

  function mark(words) {
    var wanted = new Set(words);
    var walker = document.createTreeWalker(document.body, NodeFilter.SHOW_TEXT), texts = [];
    while (walker.nextNode()) if (!/^(SCRIPT|STYLE|MARK)$/.test(walker.currentNode.parentNode.tagName)) texts.push(walker.currentNode);
    texts.forEach(function (text) { markText(text, wanted); });
    var first = document.querySelector("mark.found");
    if (first && !location.hash && first.getBoundingClientRect().bottom > innerHeight) first.scrollIntoView({ block: "center" });
  }
  function markText(text, wanted) {
    var at = 0, pieces = document.createDocumentFragment(), value = text.data;
    value.replace(WORD, function (word, place) {
      if (!wanted.has(fold(word))) return word;
      var found = document.createElement("mark");
      found.className = "found";
      found.textContent = word;
      pieces.append(value.slice(at, place), found);
      at = place + word.length;
      return word;
    });
    if (!at) return;
    pieces.append(value.slice(at));
    text.replaceWith(pieces);
  }
})();
