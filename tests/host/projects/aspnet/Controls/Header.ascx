<%@ Page Language="c#" %>
<form runat="server" this.Name = "x"></form>
