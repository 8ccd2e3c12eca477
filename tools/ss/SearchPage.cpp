#include "SearchPage.h"

#include <cstdio>

namespace tovimar::search {

namespace {

const char* const kHead = R"page(<!DOCTYPE html>
<html>
<head>
<meta charset="utf-8">
<title>Site Search</title>
<style>
body{font-family:Verdana,Arial,sans-serif;font-size:80%}
li{margin-bottom:.8em}
small{color:#555}
</style>
<script>
)page";

const char* const kScript = R"page(var BW=null;
var RX=/[\u3040-\u30ff\u3400-\u9fff\uf900-\ufaff]|(?:(?![\u3040-\u30ff\u3400-\u9fff\uf900-\ufaff])[\p{L}\p{N}\p{M}])+/gu;
function C(l){
 if(BW && !BW.closed) {BW.location.href=l;BW.focus();}
 else BW=window.open(l,"");
}
function E(t){
 return t.replace(/&/g,"&amp;").replace(/</g,"&lt;").replace(/>/g,"&gt;").replace(/"/g,"&quot;");
}
function H(w){
 var r={};
 for(var k in W) if(k.slice(0,w.length)==w){
  for(var i=0;i<W[k].length;i+=2) r[W[k][i]]=(r[W[k][i]]||0)+W[k][i+1]*(k==w?2:1);
 }
 return r;
}
function F(q){
 var ws=q.toLowerCase().match(RX)||[],r=null;
 for(var i=0;i<ws.length;i++){
  var h=H(ws[i]),n={};
  for(var p in h) if(!r||p in r) n[p]=h[p]+(r?r[p]:0);
  r=n;
 }
 return Object.keys(r||{}).sort(function(a,b){return r[b]-r[a]||a-b;});
}
function NS(){
 var q=document.forms[0].s.value,l=F(q),t="";
 for(var i=0;i<l.length;i++){
  var p=P[l[i]],u=encodeURIComponent(p[0]);
  t+='<li><a href="'+u+'" onclick="C(\''+u.replace(/'/g,"%27")+'\');return false">'+E(p[1])+'</a><br><small>'+E(p[2])+'</small></li>';
 }
 document.getElementById("r").innerHTML=q==""?"":"<p>"+l.length+" \u2014 "+E(q)+"</p><ol>"+t+"</ol>";
 return false;
}
function Q(){
 var m=/[?&]q=([^&#]*)/.exec(location.search);
 if(!m) return;
 try{document.forms[0].s.value=decodeURIComponent(m[1].replace(/\+/g," "));}
 catch(e){document.forms[0].s.value=unescape(m[1].replace(/\+/g," "));}
 NS();
}
</script>
</head>
<body onload="Q()">
| <a href="#howto">Help</a> |
<form>
<table width=100% cellpadding=5 style="background-color:#EFF;border:2px solid #069"><tr><td align=center>
<em>Site Search</em><br>
<input type=text name="s" size=24 onKeyDown="if(event.keyCode==13)return NS()">&nbsp;<input type="Button" value="Go!" onClick="return NS()">
</td></tr></table>
</form>
<div id="r"></div>
<p id="howto"><small>Pages that hold all the words are listed, those with the words in their title first. A word also finds longer words that begin with it.</small></p>
</body>
</html>
)page";

/// A string literal for a script inside a page: no character that could end the script or the literal.
std::string Quoted(const std::string& text) {
    std::string out = "\"";
    for (const char c : text) {
        const auto byte = static_cast<unsigned char>(c);
        if (c == '"' || c == '\\')
            out.append(1, '\\').append(1, c);
        else if (byte < 0x20 || c == '<' || c == '>' || c == '&') {
            char escaped[8];
            std::snprintf(escaped, sizeof escaped, "\\u%04x", byte);
            out += escaped;
        } else
            out += c;
    }
    return out + '"';
}

void AppendPages(const SearchIndex& index, std::string& out) {
    out += "var P=[\n";
    for (const auto& page : index.Pages())
        out += "[" + Quoted(page.file) + "," + Quoted(page.title) + "," + Quoted(page.summary) + "],\n";
    out += "];\n";
}

void AppendWords(const SearchIndex& index, std::string& out) {
    out += "var W={\n";
    for (const auto& [word, hits] : index.Words()) {
        out += Quoted(word) + ":[";
        const char* separator = "";
        for (const auto& [page, weight] : hits) {
            out += separator + std::to_string(page) + "," + std::to_string(weight);
            separator = ",";
        }
        out += "],\n";
    }
    out += "};\n";
}

std::string WithCrLf(const std::string& text) {
    std::string out;
    out.reserve(text.size() + text.size() / 16);
    for (const char c : text) {
        if (c == '\n')
            out += '\r';
        out += c;
    }
    return out;
}

} // namespace

std::string SearchPageText(const SearchIndex& index) {
    std::string page = kHead;
    AppendPages(index, page);
    AppendWords(index, page);
    return WithCrLf(page + kScript);
}

} // namespace tovimar::search
