// The frame page of the web help: contents tree, index and search beside the topic. Works from a file address.
(function () {
  "use strict";
  var byId = function (id) { return document.getElementById(id); };
  var frame = byId("right"), contents = byId("contents"), words = byId("words");

  // A list directly behind an entry belongs to it: the entry gets an opener.
  contents.querySelectorAll("ul").forEach(function (list) {
    var entry = list.previousElementSibling;
    if (!entry || entry.tagName !== "LI") return;
    list.classList.add("closed");
    var opener = document.createElement("span");
    opener.className = "opener";
    opener.textContent = "\u25B8";
    opener.onclick = function () { setOpen(list, list.classList.contains("closed")); };
    entry.insertBefore(opener, entry.firstChild);
    list.opener = opener;
  });
  function setOpen(list, open) {
    list.classList.toggle("closed", !open);
    if (list.opener) list.opener.textContent = open ? "\u25BE" : "\u25B8";
  }
  function reveal(link) {
    contents.querySelectorAll("a.current").forEach(function (a) { a.classList.remove("current"); });
    link.classList.add("current");
    for (var e = link.parentElement; e && e !== contents; e = e.parentElement)
      if (e.tagName === "UL") setOpen(e, true);
  }
  contents.addEventListener("click", function (event) {
    if (event.target.tagName !== "A") return;
    reveal(event.target);
    var list = event.target.parentElement.nextElementSibling;
    if (list && list.tagName === "UL") setOpen(list, true);
  });

  function show(tab) {
    var index = tab === "index";
    byId("index").hidden = !index;
    contents.hidden = index;
    byId("tabIndex").classList.toggle("active", index);
    byId("tabContents").classList.toggle("active", !index);
  }
  byId("tabContents").onclick = function () { show("contents"); return false; };
  byId("tabIndex").onclick = function () { show("index"); return false; };
  byId("toggle").onclick = function () { document.body.classList.toggle("narrow"); };

  var all = Array.prototype.slice.call(words.options);
  byId("filter").oninput = function () {
    var text = this.value.toLowerCase();
    while (words.firstChild) words.removeChild(words.firstChild);
    all.forEach(function (o) { if (o.text.toLowerCase().indexOf(text) >= 0) words.appendChild(o); });
  };
  words.onchange = function () { if (words.value) frame.src = words.value; };
  byId("search").onsubmit = function () {
    frame.src = "ss.html?q=" + encodeURIComponent(byId("query").value);
    return false;
  };

  // A topic opened by itself comes here with its own address behind the question mark. Only a page of this
  // folder is shown: anything else in the address is ignored.
  var asked = decodeURIComponent(location.search.slice(1)).replace(/"/g, "");
  var folder = location.href.replace(/[?#].*$/, "").replace(/[^/]*$/, "");
  if (asked.indexOf(folder) === 0) asked = asked.slice(folder.length);
  if (/^[^/\\:?]+\.htm(#.*)?$/i.test(asked)) frame.src = asked;
})();
